#ifndef ALDERMOOR_TOOL_INPUTFILE_H
#define ALDERMOOR_TOOL_INPUTFILE_H

#include <optional>
#include <string>

#include <sys/stat.h>

namespace Aldermoor::Tool {

/// Where the cache of an XML file is: "Cache/paper.vexb" beside "paper.xml".
std::string CachePath(const std::string& path);

/// What a file holds.
enum class FileForm {
  kXml,    ///< A document in XML.
  kCsv,    ///< A document in CSV.
  kOther,  ///< Anything else: results, a cache, the stamp of one.
};

/// A file that this run reads, or that belongs to one.
struct Input {
  std::string shown;  ///< The name that it was noted by.
  FileForm form = FileForm::kXml;
};

/// Remembers the file `path`, "-" for standard input, as what this run reads, and what belongs to
/// it under this name and that of the file to which links lead: its cache with the stamp, whether
/// they are there or not, and the documents whose cache it is.
void NoteInput(const std::string& path, FileForm form = FileForm::kXml);
/// What was noted that is the file of `status` under whatever name.  Only regular files count.
std::optional<Input> InputThatIs(const struct stat& status);
/// The same of the file to which `path` leads, or will lead once it is there.
std::optional<Input> InputThatIs(const std::string& path);

/// How a path is called in messages.
std::string ShownPath(const std::string& path);

/// The bytes of a file as they are, of standard input for "-"; notes it as an input.
/// Throws: InputError with the system's reason.
std::string ReadBytes(const std::string& path, FileForm form = FileForm::kXml);

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_INPUTFILE_H
