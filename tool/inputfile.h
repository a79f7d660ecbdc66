#ifndef ALDERMOOR_TOOL_INPUTFILE_H
#define ALDERMOOR_TOOL_INPUTFILE_H

#include <string>

#include <sys/stat.h>

namespace Aldermoor::Tool {

/// Where the cache of an XML file is: "Cache/paper.vexb" beside "paper.xml".
std::string CachePath(const std::string& path);

/// Remembers the file `path`, "-" for standard input, and its cache, as what this run reads.
void NoteInput(const std::string& path);
/// What this run reads that is the file of `status` under whatever name: the name that it was noted
/// by; empty if it is none.  Only regular files count.
std::string InputThatIs(const struct stat& status);
/// The same of the file to which `path` leads.
std::string InputThatIs(const std::string& path);

/// How a path is called in messages.
std::string ShownPath(const std::string& path);

/// The bytes of a file as they are, of standard input for "-"; notes it as an input.
/// Throws: InputError with the system's reason.
std::string ReadBytes(const std::string& path);

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_INPUTFILE_H
