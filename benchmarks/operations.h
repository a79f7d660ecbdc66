#ifndef ALDERMOOR_BENCHMARKS_OPERATIONS_H
#define ALDERMOOR_BENCHMARKS_OPERATIONS_H

#include "aldermoor/vexdoc/vex.h"

#include "benchmarks/documents.h"

namespace Aldermoor::Benchmarks {

/// Where the bytes of a document come from: its text or its file.
enum class Source { kStream, kFile };

/// "stream" or "file".
const char* NameOf(Source source);

/// Loads through VEX::Load or VEX::LoadXML.
void Load(Vexdoc::VEX& vex, const Document& document, Source source);

/// What every load has to pay at least: the same bytes through the same parser with the same
/// features into a DOM, which is freed again.
/// Throws: std::runtime_error if that gives no document.
void Parse(const Document& document, Source source);

/// Brings the process back to where a load meets no condition block of an earlier one.
void ForgetConditions();

}  // namespace Aldermoor::Benchmarks

#endif  // ALDERMOOR_BENCHMARKS_OPERATIONS_H
