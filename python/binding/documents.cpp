#include <algorithm>
#include <cerrno>
#include <filesystem>
#include <iterator>
#include <map>
#include <optional>
#include <sstream>
#include <string>
#include <string_view>
#include <system_error>
#include <utility>
#include <vector>

#include <pybind11/stl.h>
#include <unistd.h>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/inspection.h"
#include "aldermoor/vexdoc/loadoptions.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/vex.h"
#include "aldermoor/vexdoc/vexexception.h"

#include "attributes.h"
#include "errors.h"
#include "loading.h"
#include "lock.h"
#include "module.h"
#include "request.h"
#include "samplevalues.h"

namespace Aldermoor::Python {
namespace {

namespace py = pybind11;
using Utilities::Exceptions::ResourceNotAvailableException;
using Utilities::FileSystem::File;
using Utilities::Tools::SmartPointer;
using Vexdoc::Sample;
using Vexdoc::SampleSet;
using Vexdoc::VEX;

// ---- files

struct Path {
  explicit Path(const py::object& path)
      : name(py::module_::import("os").attr("fspath")(path)),
        bytes(py::module_::import("os").attr("fsencode")(name).cast<std::string>()) {
    if (bytes.find('\0') != std::string::npos) {
      throw py::value_error("path: has a NUL character");
    }
    if (bytes.empty()) {
      ThrowFileError(ENOENT, name, nullptr);
    }
  }

  py::object name;  // as Python knows it
  std::string bytes;
};

// Why a file cannot be read, or 0: the library says no more than that it is not accessible, and of
// folders that they are no XML.
int ErrorOfReading(const std::string& path) {
  std::error_code error;
  const auto status = std::filesystem::status(path, error);
  if (!std::filesystem::exists(status)) {
    return error ? error.value() : ENOENT;
  }
  if (std::filesystem::is_directory(status)) {
    return EISDIR;
  }
  return ::access(path.c_str(), R_OK) == 0 ? 0 : errno;
}

// Why one cannot be written, or 0: the library's text ends with the reason of the system.
int ErrorOfWriting(std::string_view text) {
  constexpr int kMany = 200;
  for (int error = 1; error < kMany; ++error) {
    if (text.ends_with(": " + std::generic_category().message(error))) {
      return error;
    }
  }
  return 0;
}

Owner<VEX> Load(const py::object& given, bool cache, bool no_cache,
                const std::optional<Texts>& complete, const std::string& wavelengths) {
  if (cache && no_cache) {
    throw py::value_error("cache and no_cache: one of them at most");
  }
  const Path path(given);
  Vexdoc::LoadOptions options = OptionsOf(complete, wavelengths);
  options.cache = no_cache ? Vexdoc::CacheUse::kNone
                  : cache  ? Vexdoc::CacheUse::kReadAndWrite
                           : Vexdoc::CacheUse::kRead;
  const LibraryLock lock;
  const SmartPointer<VEX> document(new VEX);
  Vexdoc::LoadReport report;
  try {
    const LibraryAlone library;
    report = document->LoadXML(File(path.bytes), options);
  } catch (const Vexdoc::VexException& e) {
    if (const int error = ErrorOfReading(path.bytes)) {
      ThrowFileError(error, path.name, &e);
    }
    if (dynamic_cast<const Vexdoc::VexParseException*>(&e) != nullptr) {
      throw;
    }
    ThrowAs("ParseError", e);
  }
  CheckComplete(report);
  return Owner<VEX>(document);
}

Owner<VEX> Loads(const std::string& text, const std::optional<Texts>& complete,
                 const std::string& wavelengths) {
  std::istringstream in(text);
  const Vexdoc::LoadOptions options = OptionsOf(complete, wavelengths);
  const LibraryLock lock;
  const SmartPointer<VEX> document(new VEX);
  Vexdoc::LoadReport report;
  try {
    const LibraryAlone library;
    report = document->Load(in, options);
  } catch (const Vexdoc::WavelengthException&) {
    throw;
  } catch (const Vexdoc::VexException& e) {
    ThrowAs("ParseError", e);
  }
  CheckComplete(report);
  return Owner<VEX>(document);
}

// Keeps the interpreter: the locale of the process is another one meanwhile.
void Save(const VEX& document, const py::object& given, bool cache) {
  const Path path(given);
  const LibraryLock lock;
  try {
    File file(path.bytes);
    Vexdoc::SaveCheckedXML(document, file, cache);
  } catch (const Vexdoc::UnsavableDocumentException& e) {
    ThrowSaveError(e);
  } catch (const ResourceNotAvailableException& e) {
    if (const int error = ErrorOfWriting(e.what())) {
      ThrowFileError(error, path.name, &e);
    }
    ThrowAs("FileError", e);
  }
}

py::list Faults(const VEX& document) {
  std::vector<Vexdoc::DocumentFault> faults;
  {
    const LibraryAlone library;
    faults = Vexdoc::CheckDocument(document);
  }
  return ToFaults(faults);
}

py::bytes Dumps(const VEX& document) {
  std::ostringstream out;
  {
    const LibraryAlone library;
    document.Store(out);
  }
  return py::bytes(out.str());
}

// ---- building

void Apply(const Texts& texts, Vexdoc::Conditions& conditions) {
  for (const auto& [key, value] : texts) {
    conditions.AddAttribute(key, value);
  }
}

template <class Attribute>
Owner<Attribute> Add(Sample& sample, Attribute* attribute) {
  const SmartPointer<Attribute> added(attribute);
  sample.AddSampleAttribute(added);
  return Owner<Attribute>(added);
}

Owner<Vexdoc::Spectrum> AddSpectrum(Sample& sample, const std::vector<float>& values,
                                    const Texts& texts) {
  CheckFinite("values", values);
  const LibraryLock lock;
  Vexdoc::Conditions conditions = MakeSpectrumConditions(values.size());
  Apply(texts, conditions);
  return Add(sample, new Vexdoc::Spectrum(conditions, values));
}

// The library takes fewer, and then cannot read what it wrote.
void CheckChannels(const std::string& space, std::size_t count) {
  const std::size_t expected = CountChannels(space);
  if (count != expected) {
    const py::object labels = py::str(", ").attr("join")(LabelsOf(space));
    throw py::value_error("values: expected " + std::to_string(expected) + " numbers for " + space +
                          " (" + labels.cast<std::string>() + "), got " + std::to_string(count));
  }
}

Owner<Vexdoc::ColorVector> AddColor(Sample& sample, const std::vector<float>& values,
                                    const std::string& space, const py::object& illuminant,
                                    const std::string& observer, const Texts& texts) {
  CheckFinite("values", values);
  const LibraryLock lock;
  Vexdoc::Conditions conditions = MakeConditions({illuminant, observer}, space);
  Apply(texts, conditions);
  CheckChannels(conditions.GetAttribute("ColorSpaceDescription.Type"), values.size());
  return Add(sample, new Vexdoc::ColorVector(conditions, values));
}

// ---- classes

/// The members of a container of named elements.
template <class Container, class Element>
void AddContainer(py::class_<Container, Owner<Container>>& type, const char* name) {
  const auto list = [](const Container& self) {
    const LibraryLock lock;
    std::vector<Owner<Element>> elements;
    for (const auto& [key, element] : self.GetElements()) {
      elements.emplace_back(element);
    }
    return elements;
  };
  type.def_property_readonly(name, list, "All, in document order, as a new list.");
  type.def("__iter__", [list](const Container& self) { return py::iter(py::cast(list(self))); });
  type.def("__len__", [](const Container& self) {
    const LibraryLock lock;
    return self.Size();
  });
  type.def("__getitem__", [](const Container& self, const std::string& key) {
    const LibraryLock lock;
    return Owner<Element>(self.FindElement(key));
  });
  type.def("__getitem__", [](const Container& self, py::ssize_t index) {
    const LibraryLock lock;
    const auto& elements = self.GetElements();
    const auto count = static_cast<py::ssize_t>(elements.size());
    if (index < -count || index >= count) {
      throw py::index_error(std::to_string(index) + " is no index of " + std::to_string(count));
    }
    return Owner<Element>(std::next(elements.begin(), index < 0 ? count + index : index)->second);
  });
  const auto any = [](const Container& self, auto is_wanted) {
    const LibraryLock lock;
    return std::ranges::any_of(self.GetElements(), is_wanted);
  };
  type.def("__contains__", [any](const Container& self, const std::string& key) {
    return any(self, [&](const auto& entry) { return entry.first == key; });
  });
  type.def("__contains__", [any](const Container& self, const Element& element) {
    return any(self, [&](const auto& entry) { return entry.second.Get() == &element; });
  });
  type.def("__contains__", [](const Container&, const py::object&) { return false; });
  type.def("__delitem__", [](Container& self, const std::string& key) {
    const LibraryLock lock;
    self.RemoveElement(self.FindElement(key));
  });
  type.def(
      "rename",
      [](Container& self, const std::string& old_name, const std::string& new_name) {
        const LibraryLock lock;
        const auto element = self.FindElement(old_name);
        self.RenameElement(old_name, new_name);
        return element->GetName();  // what is returned there may be one number further
      },
      "rename(self, old, new)\n--\n\nReturns the new name, with a number behind it if it was "
      "taken.",
      py::arg("old"), py::arg("new"));
}

/// The rows that a document or a set gives.
template <class Container>
void AddRows(py::class_<Container, Owner<Container>>& type) {
  using py::arg;
  type.def("spectra",
           py::overload_cast<const Container&, const std::optional<std::string>&>(&SpectraOf),
           R"(spectra(self, *, type=None)
--

The first spectrum of every sample: SampleRows with `values` of shape (n, 36), `names` and `sets`.

type: only spectra of this type, by their condition Physical.SpectrumType: "Remission" ...  Lights,
    whose Colorimetric.Illumination is "Emission", are "Emission" whatever that condition says.

A sample without such a spectrum of 36 values has a row of NaN.)",
           py::kw_only(), arg("type") = py::none());
  type.def("colors",
           py::overload_cast<const Container&, const std::string&, const py::object&,
                             const std::string&, const py::object&>(&ColorsOf),
           R"(colors(self, space="CIELab", *, illuminant="D50", observer="TwoDegree", paper=None)
--

The colour of every sample: SampleRows with `values` of shape (n, channels), `names` and `sets`.

Arguments as for Sample.color; a sample for which that fails has a row of NaN.)",
           arg("space") = "CIELab", py::kw_only(), arg("illuminant") = "D50",
           arg("observer") = "TwoDegree", arg("paper") = py::none());
}

void AddSampleClass(py::module_& module) {
  using py::arg;
  py::class_<Sample, Owner<Sample>> type(module, "Sample",
                                         "One specimen with its measured and computed values.");
  AddHeader(type);
  type.def_property_readonly(
      "attributes",
      [](const Sample& self) {
        const LibraryLock lock;
        std::vector<Owner<Vexdoc::SampleAttribute>> attributes;
        for (const auto& [name, attribute] : self.GetElements()) {
          attributes.emplace_back(attribute);
        }
        return attributes;
      },
      "All, as a new list: Spectrum, ColorVector, Recipe, and Attribute for unknown kinds.");
  type.def_property_readonly(
      "spectrum",
      [](const Sample& self) {
        const LibraryLock lock;
        return ToArray(SpectrumOf(self));
      },
      "The values of the first spectrum: float32, shape (36,) as a rule; a copy.");
  type.def("color", &ColorOf,
           R"(color(self, space="CIELab", *, illuminant="D50", observer="TwoDegree", paper=None)
--

The colour of the sample: a stored one that was measured so, else one computed from the spectrum,
else one converted from a stored one.

illuminant: "D65", "F11" ..., a daylight as "6500K", or 36 numbers of relative power.  Daylight is
    defined from 4000K to 25000K; beyond, it is extrapolated without a warning, and the white of
    1000K has a negative Z.
paper: 36 reflectances to which the colour is relative.

Returns float32, shape (channels,).
Raises NotFoundError or MeasureError if the sample cannot give it.)",
           arg("space") = "CIELab", py::kw_only(), arg("illuminant") = "D50",
           arg("observer") = "TwoDegree", arg("paper") = py::none());
  type.def("add_spectrum", &AddSpectrum, R"(add_spectrum(self, values, conditions={})
--

Adds a spectrum and returns it.

values: numbers, 1 = perfect reflector; for colours there must be 36, at 380 nm to 730 nm.
conditions: what is not said is a reflectance at these wavelengths; of a light,
    Colorimetric.Illumination is "Emission".

Raises ValueError for NaN and infinity, which no file keeps.)",
           arg("values"), arg("conditions") = Texts());
  type.def(
      "add_color", &AddColor,
      R"(add_color(self, values, space="CIELab", *, illuminant="D50", observer="TwoDegree", conditions={})
--

Adds a colour and returns it.

values: a number for each channel.
conditions: further ones.

Raises ValueError for another number of channels, and for NaN and infinity, which no file keeps.)",
      arg("values"), arg("space") = "CIELab", py::kw_only(), arg("illuminant") = "D50",
      arg("observer") = "TwoDegree", arg("conditions") = Texts());
}

void AddSetClass(py::module_& module) {
  py::class_<SampleSet, Owner<SampleSet>> type(module, "SampleSet",
                                               "Samples in order under unique names.");
  AddHeader(type);
  AddContainer<SampleSet, Sample>(type, "samples");
  AddRows(type);
  type.def(
      "add_sample",
      [](SampleSet& self, const std::string& name) {
        const LibraryLock lock;
        return Owner<Sample>(self.AddElement(name));
      },
      R"(add_sample(self, name)
--

Adds an empty sample and returns it; its name has a number behind it if `name` was taken.)",
      py::arg("name"));
}

void AddDocumentClass(py::module_& module) {
  using py::arg;
  py::class_<VEX, Owner<VEX>> type(module, "Document",
                                   "A document of measured colour: sample sets in order under "
                                   "unique names.");
  type.def(py::init([](const std::string& name) {
             const LibraryLock lock;
             return Owner<VEX>(new VEX(name));
           }),
           "__init__(self, name=\"\")\n--\n\nA document without sets.", arg("name") = "");
  AddHeader(type);
  AddContainer<VEX, SampleSet>(type, "sets");
  AddRows(type);
  type.def(
      "add_set",
      [](VEX& self, const std::string& name) {
        const LibraryLock lock;
        return Owner<SampleSet>(self.AddElement(name));
      },
      R"(add_set(self, name)
--

Adds an empty set and returns it; its name has a number behind it if `name` was taken.)",
      arg("name"));
  type.def("save", &Save, R"(save(self, path, cache=False)
--

Writes the document as XML; with `cache`, a binary cache beside it too.

Values are written with six significant digits.  The file is replaced as a whole, or stays as it
was.  Raises FileError, or SaveError with the `faults` of a document that could not be read again or
would come back as another one; then no file is touched.)",
           arg("path"), arg("cache") = false);
  type.def("dumps", &Dumps, R"(dumps(self)
--

The document as XML in UTF-8, as `save` writes it: values have six significant digits.

It is not checked: `faults` tells what would not come back.)");
  type.def("faults", &Faults, R"(faults(self)
--

What a file would not bring back, as a list of Fault: counts that differ from the values, conditions
that are missing, NaN.  Empty for a document that `save` writes.)");
}

unsigned long ReleaseUnusedConditions() {
  const LibraryAlone alone;
  return Vexdoc::ReleaseUnusedConditions();
}

}  // namespace

void AddDocuments(py::module_& module) {
  using py::arg;
  AddAttributeClasses(module);
  AddSampleClass(module);
  AddSetClass(module);
  AddDocumentClass(module);
  module.def("load", &Load,
             R"(load(path, cache=False, *, no_cache=False, complete=None, wavelengths="check")
--

The document in an XML file, or in the cache beside it if that is newer and of this very file: the
same either way.  What has no dates in the file has none in the document.

cache: that is written after the XML was read.
no_cache: it is not looked at.
complete: conditions, key to value, for spectra and colours that lack mandatory ones; {} for the
    number of points alone, which comes from the data.
wavelengths: what is done about spectra whose wavelengths are not those of their conditions, which
    are all that a document keeps.  "check" raises WavelengthError; "complete" takes the range from
    the points, if they have one step, and else raises it; "as told" takes what the conditions say.

Raises FileError, ParseError with the place where the file is no document, WavelengthError, or
MissingConditionError for what is still missing after a completion.)",
             arg("path"), arg("cache") = false, py::kw_only(), arg("no_cache") = false,
             arg("complete") = py::none(), arg("wavelengths") = "check");
  module.def("loads", &Loads, R"(loads(text, *, complete=None, wavelengths="check")
--

The document in XML, as `dumps` gives it; arguments as for load.)",
             arg("text"), py::kw_only(), arg("complete") = py::none(),
             arg("wavelengths") = "check");
  module.def("release_unused_conditions", &ReleaseUnusedConditions,
             R"(release_unused_conditions()
--

Frees the blocks of conditions that no attribute holds any more, and returns how many there were.
Attributes of equal conditions share one block over all documents, and the process keeps each one
that it has met; a program that goes through many documents calls this between them.)");
}

}  // namespace Aldermoor::Python
