#ifndef ALDERMOOR_VEXDOC_VEX_H
#define ALDERMOOR_VEXDOC_VEX_H

#include <iosfwd>
#include <string>

#include "aldermoor/export.h"
#include "aldermoor/utilities/filesystem/file.h"
#include "aldermoor/vexdoc/sampleiterator.h"
#include "aldermoor/vexdoc/sampleset.h"
#include "aldermoor/vexdoc/vexnode.h"

namespace Aldermoor::Vexdoc {

struct LoadOptions;
struct LoadReport;

extern template class ALDERMOOR_EXPORT VexNode<SampleSet, UniqueStoragePolicy<SampleSet>>;

/// The look-up and the streams of a document, as a layer of its own.
template <class T, class StoragePolicy>
class DeprecatedVEXInterface : public VexNode<T, StoragePolicy> {
 public:
  virtual Utilities::Tools::SmartPointer<T> GetSampleSet(const std::string& name) const = 0;
  virtual void Store(std::ostream& out) const = 0;
  virtual void Load(std::istream& in) = 0;

 protected:
  using VexNode<T, StoragePolicy>::VexNode;
};

/// A document of measured colour: sample sets in order under unique names.
///
/// A document belongs to one thread at a time.  For reading and writing, the application keeps an
/// XMLPlatform alive.
class ALDERMOOR_EXPORT VEX
    : public DeprecatedVEXInterface<SampleSet, UniqueStoragePolicy<SampleSet>> {
 public:
  explicit VEX(const std::string& name = "");
  /// Deep.
  VEX(const VEX& other);
  VEX& operator=(const VEX& other);
  ~VEX() override;

  /// Throws: ResourceNotAvailableException if there is no such set.
  Utilities::Tools::SmartPointer<SampleSet> GetSampleSet(const std::string& name) const override;
  /// Writes this document as XML of the current dialect, in UTF-8.  Derived attributes and their
  /// conditions are left out; floats get six significant digits.
  ///
  /// What a load refuses is written all the same: spectra whose number of points is not that of
  /// their conditions, and colours of a legacy document without observer (docs/xmlformat.md).
  /// SaveCheckedXML of inspection.h refuses it.
  /// Throws: VexException if the document holds text that XML cannot carry;
  /// InvalidArgumentException for a range of wavelengths that is no number; NullPointerException
  /// for an attribute without conditions.  The message names the set and the sample.
  void Store(std::ostream& out) const override;
  /// Replaces the content of this document by the XML read from `in`.  Its sets are removed first,
  /// and stay so if the text cannot be read.
  /// Throws: VexXMLParseException with line and column if the text is not well-formed;
  /// VexException if its content breaks a rule.
  void Load(std::istream& in) override;
  /// Replaces the content of this document by that of the XML file `file`, or of its cache if that
  /// is newer, good and of this very file; on failure it stays as it was.
  ///
  /// The cache of "paper.xml" is "Cache/paper.vexb" beside it, and "Cache/paper.vexb.stamp" ties it
  /// to the bytes of the XML file, by size, times and hash (docs/binaryformat.md).  With
  /// `updateCache`, it is written after the XML was read; a failure of that is not reported.
  /// Throws: VexXMLParseException with file, line and column if the text is not well-formed;
  /// VexParseException and VexException if its content breaks a rule or the file cannot be read.
  void LoadXML(const Utilities::FileSystem::File& file, bool updateCache);
  /// The same two, but with nothing in the document that the text does not say: elements for which
  /// it has no dates have none, and spectra whose wavelengths are not those of their conditions are
  /// refused, completed or told as `options` ask (loadoptions.h).  A cache is taken only if its
  /// stamp says that it holds exactly what the XML file does.  On failure, the document stays as it
  /// was with both. Throws: WavelengthException with sets, samples and wavelengths; what the plain
  /// ones throw.
  LoadReport Load(std::istream& in, const LoadOptions& options);
  LoadReport LoadXML(const Utilities::FileSystem::File& file, const LoadOptions& options);
  /// Writes this document to `file` as Store does.  With `updateCache`, the text is read again, and
  /// the document that it gives written to the cache; text that a load refuses gets none.
  ///
  /// Files are replaced as a whole: on failure the old file is still there.  Only where a file may
  /// be written but not be replaced, for lack of rights in its folder, it is written in place.
  /// Permissions of a cache are those of its XML file.  The process locale is changed for the time
  /// of the call, so nothing that depends on it may run beside it.
  /// Throws: ResourceNotAvailableException with the system's reason if a file cannot be written;
  /// what Store throws.
  void SaveXML(Utilities::FileSystem::File& file, bool updateCache) const;

  /// The forms that add or insert keep a copy and return its name, which is another one if the
  /// name was taken.  Indices count from 0 to the number of children.
  /// Throws: OutOfRangeException for another index, and nothing is changed.
  std::string AddSampleSet(const SampleSet& set);
  std::string AddSampleSet(const std::string& name);
  std::string InsertSampleSet(const SampleSet& set, const long& position);
  std::string InsertSampleSet(const std::string& name, const long& position);
  std::string RenameSampleSet(const std::string& oldName, const std::string& newName);
  void RemoveSampleSet(const std::string& name);
  void RemoveAllSampleSets();
  const ElementList<SampleSet>& GetSampleSets() const { return GetElements(); }
  unsigned long GetSampleSetCount() const { return Size(); }

  /// A set of that name is made if there is none, unless the sample cannot be added.
  std::string AddSample(const std::string& setName, const Sample& sample);
  std::string InsertSample(const std::string& setName, const Sample& sample, const long& position);
  /// Inserts a copy in front of the sample on which `position` stands, and moves `position` to the
  /// entry behind that one.
  /// Throws: VexException if `position` stands on no sample of this document.
  std::string InsertSample(const Sample& sample, SampleIterator& position);
  /// Throws: OutOfRangeException if there is no such set or no such sample in it.
  Utilities::Tools::SmartPointer<Sample> FindSample(const std::string& setName,
                                                    const std::string& sampleName) const;
  /// A walk over the samples of the set `setName`, or of all sets if that is empty.
  SampleIterator GetFirstSample(const std::string& setName) const;
  /// The same over the samples that can give an attribute of the kind `attributeType` under
  /// `filter`.  Throws: what Sample::GetSampleAttribute throws but ResourceNotAvailableException.
  SampleIterator GetFirstSample(const Conditions& filter, const std::string& attributeType,
                                const std::string& setName) const;
  /// Throws: ResourceNotAvailableException if there is no such set or no such sample in it.
  std::string RenameSample(const std::string& setName, const std::string& oldName,
                           const std::string& newName);
  /// Throws: ResourceNotAvailableException for the set, VexException for a missing sample.
  void SwapSample(const std::string& setName, const std::string& first, const std::string& second);
  /// "Unknown" if there is no such set.
  std::string GetUniqueSampleName(const std::string& setName, const std::string& name) const;

  /// Throws: std::logic_error, always: a document is the root.
  void SetParent(Header* parent) override;
  void AcceptVisitor(ElementVisitor& visitor) override;

 private:
  template <class Fill>
  std::string FillSampleSet(const std::string& setName, const Fill& fill);
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_VEX_H
