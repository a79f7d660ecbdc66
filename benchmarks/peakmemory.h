#ifndef ALDERMOOR_BENCHMARKS_PEAKMEMORY_H
#define ALDERMOOR_BENCHMARKS_PEAKMEMORY_H

#include <string>

#include "benchmarks/operations.h"

namespace Aldermoor::Benchmarks {

/// What a child process does before it tells its peak of resident memory.  An idle one only
/// prepares what the others have before they begin: the XML platform and, for a stream, the text.
/// "Tree" loads a file like "load" and tells what is resident in the end instead of the peak; both
/// take the cache if there is a good one.
enum class Task { kIdle, kParse, kLoad, kTree };

/// Peak memory of `task` above that of an idle process, in bytes: the median over several child
/// processes of this same program, each with nothing else on its heap.
/// Throws: std::runtime_error if a child fails.
double PeakMemory(Task task, const Document& document, Source source);

/// Whether the arguments are those of a child process.
bool IsChild(int argc, char** argv);
/// The main function of a child process.
int RunChild(char** argv);

}  // namespace Aldermoor::Benchmarks

#endif  // ALDERMOOR_BENCHMARKS_PEAKMEMORY_H
