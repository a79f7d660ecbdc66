#include "aldermoor/vexdoc/vex.h"

#include <istream>
#include <ostream>
#include <stdexcept>
#include <string_view>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/filesystem/path.h"
#include "aldermoor/utilities/filesystem/posix/filestamp.h"
#include "aldermoor/vexdoc/elementvisitor.h"
#include "aldermoor/vexdoc/internals/binaryprovider.h"
#include "aldermoor/vexdoc/internals/xercesadapter.h"
#include "aldermoor/vexdoc/loadoptions.h"
#include "aldermoor/vexdoc/vexexception.h"
#include "aldermoor/vexdoc/vexnode.inl.h"

namespace Aldermoor::Vexdoc {

using Platform::Posix::FileStamp;
using Utilities::Exceptions::OutOfRangeException;
using Utilities::Exceptions::ResourceNotAvailableException;
using Utilities::FileSystem::File;
using Utilities::Tools::SmartPointer;

namespace {

// Both only read the document of a `const` operation.
SmartPointer<Internals::XMLParserAdapter> GetXMLParserAdapter(const VEX& document) {
  return SmartPointer<Internals::XMLParserAdapter>(
      new Internals::XercesAdapter(const_cast<VEX*>(&document)));
}

SmartPointer<Internals::BinaryProvider> GetBinaryProvider(const VEX& document) {
  return SmartPointer<Internals::BinaryProvider>(
      new Internals::BinaryProvider(const_cast<VEX*>(&document)));
}

constexpr const char* kCacheDirectory = "Cache";

// "Cache/paper.vexb" beside "paper.xml".
File GetCacheFile(const File& xml) {
  namespace FileSystem = Utilities::FileSystem;
  constexpr std::string_view kExtension = ".xml";
  std::string stem = xml.GetName();
  if (xml.IsOfType(std::string(kExtension))) {
    stem.resize(stem.size() - kExtension.size());
  }
  const std::string directory =
      FileSystem::JoinPath(FileSystem::ParentPath(xml.GetAbsoluteName()), kCacheDirectory);
  return File(FileSystem::JoinPath(directory, stem + ".vexb"), 0, 0);
}

FileStamp StampOf(const File& file) {
  return FileStamp(file.GetAbsolutePlatformName());
}

// Whatever is wrong with a cache, the XML file is there.
bool LoadFromCache(VEX& document, File& cache, const File& xml) {
  try {
    // Not by the dates of File: that of a file which cannot be opened for a moment is the present.
    if (!cache.IsAccessable(false) || !StampOf(cache).IsLaterThan(StampOf(xml))) {
      return false;
    }
    GetBinaryProvider(document)->Read(cache);
    return true;
  } catch (...) {
    return false;
  }
}

// Another process may have replaced the XML file while the cache of the former one was written.
void DropCacheOfOldFile(const File& cache, const File& xml, const FileStamp& stamp) {
  if (StampOf(xml) != stamp) {
    cache.Remove();
  }
}

void RemoveQuietly(const File& file) {
  try {
    file.Remove();
  } catch (...) {
    // Memory is short, and there is nobody to tell.
  }
}

void LoadFromText(Internals::XMLParserAdapter& adapter, const File& file) {
  try {
    File xml(file.GetAbsoluteName());
    adapter.Load(xml);
  } catch (const VexException&) {
    throw;
  } catch (const std::exception& e) {
    throw VexException(e.what(), ALDERMOOR_HERE(Aldermoor::Vexdoc::VEX::LoadXML));
  }
}

// The document is loaded all the same if that fails.
void UpdateCacheQuietly(const VEX& document, File& cache, const File& xml, const FileStamp& stamp) {
  try {
    xml.GetDirectory().CreateSubdir(kCacheDirectory);
    GetBinaryProvider(document)->Write(cache);
    DropCacheOfOldFile(cache, xml, stamp);
  } catch (...) {
    RemoveQuietly(cache);
  }
}

void ApplyTypeCreator(File& file) {
  try {
    file.ApplyMacTypeCreator();
  } catch (const Utilities::Exceptions::ResourceException&) {
    // The content is there all the same.
  }
}

}  // namespace

template class VexNode<SampleSet, UniqueStoragePolicy<SampleSet>>;

VEX::VEX(const std::string& name) try : DeprecatedVEXInterface(name) {}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::VEX)

VEX::VEX(const VEX&) = default;
VEX& VEX::operator=(const VEX&) = default;
VEX::~VEX() = default;

SmartPointer<SampleSet> VEX::GetSampleSet(const std::string& name) const try {
  return FindElement(name);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::GetSampleSet)

void VEX::Load(std::istream& in) try {
  Clear();
  GetXMLParserAdapter(*this)->Load(in);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::Load)

LoadReport VEX::Load(std::istream& in, const LoadOptions& options) try {
  LoadReport report;
  Internals::XercesAdapter adapter(this);
  adapter.SetOptions(options, report);
  adapter.Load(in);
  return report;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::Load)

void VEX::Store(std::ostream& out) const try { GetXMLParserAdapter(*this)->Store(out); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::Store)

void VEX::LoadXML(const File& file, bool updateCache) try {
  File cache = GetCacheFile(file);
  if (LoadFromCache(*this, cache, file)) {
    return;
  }
  const FileStamp stamp = StampOf(file);
  LoadFromText(*GetXMLParserAdapter(*this), file);
  if (updateCache) {
    UpdateCacheQuietly(*this, cache, file, stamp);
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::LoadXML)

LoadReport VEX::LoadXML(const File& file, const LoadOptions& options) try {
  LoadReport report;
  File cache = GetCacheFile(file);
  const bool reads_cache =
      options.cache != CacheUse::kNone && options.wavelengths != WavelengthUse::kComplete;
  if (reads_cache && LoadFromCache(*this, cache, file)) {
    report.from_cache = true;
    if (options.completion) {
      report.completion = CompleteConditions(*this, *options.completion);
    }
    return report;
  }
  report.cache_reason = reads_cache ? "there is no good one" : "it was not asked for";
  const FileStamp stamp = StampOf(file);
  Internals::XercesAdapter adapter(this);
  adapter.SetOptions(options, report);
  LoadFromText(adapter, file);
  // A cache answers for the file, not for what was added to its document.
  if (options.cache == CacheUse::kReadAndWrite && adapter.WasExact() && !report.HasCompleted()) {
    UpdateCacheQuietly(*this, cache, file, stamp);
  }
  return report;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::LoadXML)

void VEX::SaveXML(File& file, bool updateCache) const try {
  const FileStamp stamp = GetXMLParserAdapter(*this)->Store(file);
  ApplyTypeCreator(file);
  if (!updateCache) {
    return;
  }
  file.GetDirectory().CreateSubdir(kCacheDirectory);
  File cache = GetCacheFile(file);
  GetBinaryProvider(*this)->Write(cache);
  ApplyTypeCreator(cache);
  DropCacheOfOldFile(cache, file, stamp);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::SaveXML)

std::string VEX::AddSampleSet(const SampleSet& set) try { return AppendNamed(set); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::AddSampleSet)

std::string VEX::AddSampleSet(const std::string& name) try { return AppendNamed(SampleSet(name)); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::AddSampleSet)

std::string VEX::InsertSampleSet(const SampleSet& set, const long& position) try {
  return InsertNamed(set, position);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::InsertSampleSet)

std::string VEX::InsertSampleSet(const std::string& name, const long& position) try {
  return InsertNamed(SampleSet(name), position);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::InsertSampleSet)

std::string VEX::RenameSampleSet(const std::string& oldName, const std::string& newName) try {
  return RenameElement(oldName, newName);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::RenameSampleSet)

void VEX::RemoveSampleSet(const std::string& name) try { RemoveElement(name); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::RemoveSampleSet)

void VEX::RemoveAllSampleSets() try { Clear(); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::RemoveAllSampleSets)

// A set that is new comes into the document when it is filled, so that a failure leaves none.
template <class Fill>
std::string VEX::FillSampleSet(const std::string& setName, const Fill& fill) {
  if (const SmartPointer<SampleSet> found = LookUp(setName)) {
    return fill(*found);
  }
  const SmartPointer<SampleSet> set(new SampleSet(setName));
  std::string name = fill(*set);
  AppendNew(set);
  return name;
}

std::string VEX::AddSample(const std::string& setName, const Sample& sample) try {
  return FillSampleSet(setName, [&](SampleSet& set) { return set.AddSample(sample); });
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::AddSample)

std::string VEX::InsertSample(const std::string& setName, const Sample& sample,
                              const long& position) try {
  return FillSampleSet(setName, [&](SampleSet& set) { return set.InsertNamed(sample, position); });
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::InsertSample)

std::string VEX::InsertSample(const Sample& sample, SampleIterator& position) try {
  if (!position.HasNext() || position.sets_ != &GetElements()) {
    throw VexException("SampleIterator not valid",
                       ALDERMOOR_HERE(Aldermoor::Vexdoc::VEX::InsertSample));
  }
  return position.place_.set->second->InsertSample(sample, position);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::InsertSample)

SampleIterator VEX::GetFirstSample(const std::string& setName) const try {
  return SampleIterator(GetElements(), setName);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::GetFirstSample)

SampleIterator VEX::GetFirstSample(const Conditions& filter, const std::string& attributeType,
                                   const std::string& setName) const try {
  return SampleIterator(GetElements(), filter, attributeType, setName);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::GetFirstSample)

SmartPointer<Sample> VEX::FindSample(const std::string& setName,
                                     const std::string& sampleName) const try {
  try {
    return FindElement(setName)->FindElement(sampleName);
  } catch (const ResourceNotAvailableException& e) {
    throw OutOfRangeException(e.what(), ALDERMOOR_HERE(Aldermoor::Vexdoc::VEX::FindSample));
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::FindSample)

std::string VEX::RenameSample(const std::string& setName, const std::string& oldName,
                              const std::string& newName) try {
  return FindElement(setName, false)->RenameSample(oldName, newName);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::RenameSample)

void VEX::SwapSample(const std::string& setName, const std::string& first,
                     const std::string& second) try {
  FindElement(setName, false)->SwapSample(first, second);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::SwapSample)

std::string VEX::GetUniqueSampleName(const std::string& setName, const std::string& name) const
    try {
  try {
    return FindElement(setName)->GetUniqueName(name);
  } catch (const ResourceNotAvailableException&) {
    return "Unknown";
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::GetUniqueSampleName)

void VEX::SetParent(Header* /*parent*/) {
  throw std::logic_error("VEX is already THE root element and can not accept a parent therefore");
}

void VEX::AcceptVisitor(ElementVisitor& visitor) try { visitor.VisitVex(*this); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::AcceptVisitor)

}  // namespace Aldermoor::Vexdoc
