#ifndef ALDERMOOR_TOOL_INPUTFILE_H
#define ALDERMOOR_TOOL_INPUTFILE_H

#include <string>

namespace Aldermoor::Tool {

/// How a path is called in messages.
std::string ShownPath(const std::string& path);

/// The bytes of a file as they are, of standard input for "-".
/// Throws: InputError with the system's reason.
std::string ReadBytes(const std::string& path);

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_INPUTFILE_H
