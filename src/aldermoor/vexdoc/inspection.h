#ifndef ALDERMOOR_VEXDOC_INSPECTION_H
#define ALDERMOOR_VEXDOC_INSPECTION_H

#include <iosfwd>
#include <string>
#include <vector>

#include "aldermoor/export.h"
#include "aldermoor/utilities/filesystem/file.h"

/// Checks of files for people who want to know everything that is wrong with one, where a load
/// tells the first fault only.
namespace Aldermoor::Vexdoc {

/// Something in a file that is against the rules of its format.
struct Fault {
  enum class Severity {
    kError,    ///< The document cannot be read.
    kWarning,  ///< The document is read, but something in it is lost or can hardly be meant.
  };

  Severity severity = Severity::kError;
  /// One line of plain words.  Quotes what the file holds as it is, control characters too.
  std::string text;
  /// The place in a text, counted from 1: where the element begins, or where the parser stopped.
  /// 0 if it is not known, and in a cache.
  unsigned int line = 0;
  unsigned int column = 0;
  /// The place in a cache: the first byte of the field, counted from 0.  0 in a text.
  unsigned long long offset = 0;
};

/// The faults of a document in XML of either dialect, in the order of the text.
///
/// A text without errors is one that VEX::LoadXML reads from the file itself; caches take no part.
/// The check goes on behind a fault, but a text that is not well-formed, and one whose root is no
/// document, have that fault alone.  The XML platform must be up.  Shared state: none.
/// Throws: ResourceNotAvailableException with name and reason if the file cannot be read;
/// VexException if the XML platform is not initialised.
ALDERMOOR_EXPORT std::vector<Fault> CheckXML(const Utilities::FileSystem::File& file);
/// The same of all that `in` still holds.
ALDERMOOR_EXPORT std::vector<Fault> CheckXML(std::istream& in);

/// The faults of the binary cache of a document, by offset.
///
/// A cache without errors is one that loads.  The check ends at the first fault behind which the
/// next field cannot be found.  Shared state: none.
/// Throws: ResourceNotAvailableException with name and reason if the file cannot be read.
ALDERMOOR_EXPORT std::vector<Fault> CheckCache(const Utilities::FileSystem::File& file);
/// The same of all that `in` still holds.
ALDERMOOR_EXPORT std::vector<Fault> CheckCache(std::istream& in);

/// Which of the two a load of a document takes.
struct CacheState {
  /// The absolute name of the cache.
  std::string path;
  /// Whether anything is there.
  bool exists = false;
  /// Whether a load with options that allow it takes the cache.
  bool is_used = false;
  /// Why it does not: "absent", or plain words that go on after "not used: "; empty if it does.
  std::string reason;
};

/// Looks at the cache of the XML file `xml` as VEX::LoadXML does, and changes nothing.
ALDERMOOR_EXPORT CacheState StateOfCache(const Utilities::FileSystem::File& xml);

/// Writes the bytes of a binary cache for people: a line or more a field with its offset and bytes
/// in hexadecimal and what they mean in words, indented by nesting.
///
/// Ends at the first fault behind which the next field cannot be found, with a line that tells it.
/// Returns whether there was none.
ALDERMOOR_EXPORT bool DumpCache(std::istream& in, std::ostream& out);

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_INSPECTION_H
