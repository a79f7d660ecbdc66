#ifndef ALDERMOOR_VEXDOC_INSPECTION_H
#define ALDERMOOR_VEXDOC_INSPECTION_H

#include <cstddef>
#include <iosfwd>
#include <string>
#include <vector>

#include "aldermoor/export.h"
#include "aldermoor/utilities/filesystem/file.h"
#include "aldermoor/vexdoc/vexexception.h"

/// Checks of files, for people who want to know everything that is wrong with one where a load
/// tells the first fault only, and of documents before they become files.
namespace Aldermoor::Vexdoc {

class VEX;

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
  /// What the document that is read from the file does not say, or not in the same way.
  enum class Loss {
    kNone,
    kContent,
    kWavelengths,  ///< Those of a spectrum, which are not those of its conditions; see LoadOptions.
    kLabels,       ///< Kept, but the values count for other channels than the labels name.
  };
  Loss loss = Loss::kNone;
  /// Further faults, elsewhere, that differ from this one in quoted texts and numbers only.  They
  /// are not listed.
  std::size_t repeats = 0;
};

/// The faults of a document in XML of either dialect, in the order of the text.
///
/// A text without errors is one that VEX::LoadXML reads from the file itself; caches take no part.
/// Of faults that are alike, the first ten are listed; the last of them has the number of the
/// others. The check goes on behind a fault, but a text that is not well-formed, and one whose root
/// is no document, have that fault alone.  The XML platform must be up.  Shared state: none.
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

/// Something in a document that a file would not bring back.
struct DocumentFault {
  /// The names of the sample set and the sample; empty above them.
  std::string set;
  std::string sample;
  /// The kind of the attribute and its name, or its number, counted from 1, if it has none:
  /// "Spectrum 'M0'", "ColorVector 2".  Empty for what belongs to no attribute.
  std::string attribute;
  /// One line of plain words.
  std::string reason;

  /// "set 'x', sample 'y', Spectrum 1: " and the reason.
  ALDERMOOR_EXPORT std::string GetText() const;
};

/// The faults of a document in the order of its elements: whatever VEX::SaveXML would refuse, a
/// load of the file would refuse, or would come back as something else.
///
/// A document without faults is read again with the same content, but for what docs/xmlformat.md
/// names: digits beyond the sixth, derived attributes, dates that were not there.  What is wrong
/// with a condition block is told at the first attribute that holds it.  For the cache, which keeps
/// every bit, the rules of conditions and of structure hold too.  The XML platform must be up.
/// Shared state: none.
/// Throws: VexException if the XML platform is not initialised.
ALDERMOOR_EXPORT std::vector<DocumentFault> CheckDocument(const VEX& document);

/// A document was not saved, since it has faults.  The message tells the first one and how many
/// there are.
class ALDERMOOR_EXPORT UnsavableDocumentException : public VexException {
 public:
  /// There must be a fault.
  UnsavableDocumentException(const std::vector<DocumentFault>& faults, const std::string& location);

  const std::vector<DocumentFault>& GetFaults() const { return faults_; }

 private:
  std::vector<DocumentFault> faults_;
};

/// VEX::SaveXML for documents without faults: what it writes can be read, and says the same.
///
/// Throws: UnsavableDocumentException if CheckDocument finds any fault, before a file is touched;
/// what VEX::SaveXML throws.
ALDERMOOR_EXPORT void SaveCheckedXML(const VEX& document, Utilities::FileSystem::File& file,
                                     bool updateCache);

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_INSPECTION_H
