#include "errors.h"

#include <algorithm>
#include <cerrno>
#include <exception>
#include <string>
#include <system_error>

#include <pybind11/pybind11.h>

#include "aldermoor/measure/measureexception.h"
#include "aldermoor/tristim/tristimexception.h"
#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/vexdoc/vexexception.h"

#include "module.h"

namespace Aldermoor::Python {
namespace {

namespace py = pybind11;
using Utilities::Exceptions::TraceableException;

py::tuple TraceOf(const TraceableException& failure) {
  py::list places;
  for (const std::string& place : failure.where()) {
    if (!place.empty()) {
      places.append(place);
    }
  }
  return py::tuple(places);
}

// A message may quote bytes of a damaged file.
py::object TextOf(const std::string& message) {
  return py::bytes(message).attr("decode")("utf-8", "replace");
}

py::object ClassOf(const char* name) {
  return py::module_::import("aldermoor._errors").attr(name);
}

py::object MakeError(const char* name, const TraceableException& failure) {
  const py::object error = ClassOf(name)(TextOf(failure.what()));
  error.attr("trace") = TraceOf(failure);
  if (const auto* place = dynamic_cast<const Vexdoc::VexXMLParseException*>(&failure)) {
    error.attr("line") = place->GetLine();
    error.attr("column") = place->GetColumn();
  }
  return error;
}

void Set(const py::object& error) {
  PyErr_SetObject(py::type::of(error).ptr(), error.ptr());
}

void Set(const char* name, const TraceableException& failure) {
  Set(MakeError(name, failure));
}

void Translate(std::exception_ptr thrown) {
  namespace Exceptions = Utilities::Exceptions;
  try {
    std::rethrow_exception(thrown);
  } catch (const Exceptions::BadAllocException&) {
    PyErr_NoMemory();
  } catch (const Vexdoc::VexXMLParseException& e) {
    const py::object error = MakeError("ParseError", e);
    error.attr("file") = TextOf(e.GetFile());
    Set(error);
  } catch (const Vexdoc::WavelengthException& e) {
    Set("WavelengthError", e);
  } catch (const Vexdoc::VexParseException& e) {
    Set("ParseError", e);
  } catch (const Vexdoc::MissingConditionException& e) {
    Set("MissingConditionError", e);
  } catch (const Exceptions::ResourceNotAvailableException& e) {
    Set("NotFoundError", e);
  } catch (const Exceptions::OutOfRangeException& e) {
    Set("NotFoundError", e);
  } catch (const Measure::MeasureException& e) {
    Set("MeasureError", e);
  } catch (const Tristim::TristimException& e) {
    Set("MeasureError", e);
  } catch (const TraceableException& e) {
    Set("Error", e);
  }
}

}  // namespace

void ThrowAs(const char* name, const TraceableException& failure) {
  Set(name, failure);
  throw py::error_already_set();
}

void ThrowSaveError(const Vexdoc::UnsavableDocumentException& failure) {
  constexpr std::size_t kMostTold = 100;
  const std::vector<Vexdoc::DocumentFault>& faults = failure.GetFaults();
  std::string text = "the document cannot be saved as it is:";
  for (std::size_t i = 0; i < std::min(faults.size(), kMostTold); ++i) {
    text += "\n" + faults[i].GetText();
  }
  if (faults.size() > kMostTold) {
    text += "\nand " + std::to_string(faults.size() - kMostTold) + " more";
  }
  const py::object error = ClassOf("SaveError")(TextOf(text));
  error.attr("trace") = TraceOf(failure);
  error.attr("faults") = py::tuple(ToFaults(faults));
  Set(error);
  throw py::error_already_set();
}

py::list ToFaults(const std::vector<Vexdoc::DocumentFault>& faults) {
  const py::object type = py::module_::import("aldermoor._results").attr("Fault");
  py::list list;
  for (const Vexdoc::DocumentFault& fault : faults) {
    list.append(type(TextOf(fault.set), TextOf(fault.sample), TextOf(fault.attribute),
                     TextOf(fault.reason)));
  }
  return list;
}

void ThrowFileError(int error, const py::object& path, const TraceableException* failure) {
  const py::object made = ClassOf(error == ENOENT ? "MissingFileError" : "FileError")(
      error, std::generic_category().message(error), path);
  if (failure != nullptr) {
    made.attr("trace") = TraceOf(*failure);
  }
  Set(made);
  throw py::error_already_set();
}

void AddErrors() {
  py::register_exception_translator(&Translate);
}

}  // namespace Aldermoor::Python
