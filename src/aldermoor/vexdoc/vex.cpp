#include "aldermoor/vexdoc/vex.h"

#include <filesystem>
#include <istream>
#include <new>
#include <ostream>
#include <stdexcept>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/filesystem/posix/filereplacement.h"
#include "aldermoor/vexdoc/elementvisitor.h"
#include "aldermoor/vexdoc/internals/binaryprovider.h"
#include "aldermoor/vexdoc/internals/xercesadapter.h"
#include "aldermoor/vexdoc/internals/xmlcache.h"
#include "aldermoor/vexdoc/loadoptions.h"
#include "aldermoor/vexdoc/vexexception.h"
#include "aldermoor/vexdoc/vexnode.inl.h"

namespace Aldermoor::Vexdoc {

using Internals::XmlCache;
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

// Why the document did not come from the cache; empty if it did.  Whatever is wrong with a cache,
// the XML file is there.
std::string LoadFromCache(VEX& document, const XmlCache& cache, XmlCache::Need need, CacheUse use) {
  XmlCache::Found found;
  try {
    found = cache.Find(need);
    if (!found.IsUsable()) {
      return found.reason;
    }
    Internals::LoadRules rules;
    rules.gives_dates = need == XmlCache::Need::kAny;
    GetBinaryProvider(document)->Read(found.GetBytes(), rules);
  } catch (const std::exception& e) {
    return e.what();
  }
  try {
    if (found.renewed && use == CacheUse::kReadAndWrite) {
      cache.Renew(*found.renewed);
    }
  } catch (const std::exception&) {
    // The next load has to read the XML file once more.
  }
  return "";
}

void RemoveQuietly(const XmlCache& cache) {
  try {
    cache.Remove();
  } catch (...) {
    // Memory is short, and there is nobody to tell.
  }
}

Internals::XmlReading LoadFromText(Internals::XMLParserAdapter& adapter, const File& file) {
  try {
    File xml(file.GetAbsoluteName());
    return adapter.Load(xml);
  } catch (const VexException&) {
    throw;
  } catch (const std::exception& e) {
    throw VexException(e.what(), ALDERMOOR_HERE(Aldermoor::Vexdoc::VEX::LoadXML));
  }
}

// The document is loaded all the same if that fails.
void UpdateCacheQuietly(VEX& document, XmlCache& cache, const Internals::XmlReading& reading,
                        bool is_exact) {
  try {
    cache.Write(document, reading, is_exact);
  } catch (...) {
    RemoveQuietly(cache);
  }
}

// The document that the XML of a save gives when it is read: without the digits that the text does
// not carry, and whatever else.  A cache of what was in memory would differ from its XML file.
void WriteCacheOfSaved(const File& file, const Platform::Posix::ContentMark& written) {
  XmlCache cache(file);
  VEX stored;
  LoadOptions options;
  options.wavelengths = WavelengthUse::kReport;
  LoadReport report;
  Internals::XercesAdapter adapter(&stored);
  adapter.SetOptions(options, report);
  Internals::XmlReading reading;
  try {
    File xml(file.GetAbsoluteName());
    reading = adapter.Load(xml);
  } catch (const std::bad_alloc&) {
    throw;
  } catch (const std::exception&) {
    cache.Remove();  // for text that a load refuses, or a file that its writer may not read
    return;
  }
  if (reading.hash == written.hash && reading.state.size == written.size) {
    cache.Write(stored, reading, adapter.WasExact());
  }
  // Else somebody has replaced the file since, and writes a cache of his own.
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
  XmlCache cache(file);
  const CacheUse use = updateCache ? CacheUse::kReadAndWrite : CacheUse::kRead;
  if (LoadFromCache(*this, cache, XmlCache::Need::kAny, use).empty()) {
    return;
  }
  Internals::XercesAdapter adapter(this);
  const Internals::XmlReading reading = LoadFromText(adapter, file);
  if (updateCache) {
    UpdateCacheQuietly(*this, cache, reading, adapter.WasExact());
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::LoadXML)

LoadReport VEX::LoadXML(const File& file, const LoadOptions& options) try {
  LoadReport report;
  XmlCache cache(file);
  // A cache does not hold the points of the file, from which a range is taken, or with which a
  // range that is given has to agree.
  const bool needs_points =
      options.wavelengths == WavelengthUse::kComplete || options.completion.has_value();
  if (options.cache != CacheUse::kNone && !needs_points) {
    report.cache_reason = LoadFromCache(*this, cache, XmlCache::Need::kExact, options.cache);
    report.from_cache = report.cache_reason.empty();
  }
  if (report.from_cache) {
    return report;
  }
  Internals::XercesAdapter adapter(this);
  adapter.SetOptions(options, report);
  const Internals::XmlReading reading = LoadFromText(adapter, file);
  // A cache answers for the file, not for what was added to its document.
  if (options.cache == CacheUse::kReadAndWrite && adapter.WasExact() && !report.HasCompleted()) {
    UpdateCacheQuietly(*this, cache, reading, true);
  }
  return report;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::LoadXML)

void VEX::SaveXML(File& file, bool updateCache) const try {
  const Platform::Posix::ContentMark written = GetXMLParserAdapter(*this)->Store(file);
  ApplyTypeCreator(file);
  // Beside a device there is no place for a cache, and a pipe is not read again.
  if (updateCache && std::filesystem::is_regular_file(file.GetAbsolutePlatformName())) {
    WriteCacheOfSaved(file, written);
  }
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
