#include "errors.h"

#include <exception>
#include <string>

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
py::object TextOf(const char* message) {
  return py::bytes(message).attr("decode")("utf-8", "replace");
}

void Set(const char* name, const TraceableException& failure) {
  const py::object type = py::module_::import("aldermoor._errors").attr(name);
  const py::object error = type(TextOf(failure.what()));
  error.attr("trace") = TraceOf(failure);
  if (const auto* place = dynamic_cast<const Vexdoc::VexXMLParseException*>(&failure)) {
    error.attr("file") = TextOf(place->GetFile().c_str());
    error.attr("line") = place->GetLine();
    error.attr("column") = place->GetColumn();
  }
  PyErr_SetObject(type.ptr(), error.ptr());
}

void Translate(std::exception_ptr thrown) {
  namespace Exceptions = Utilities::Exceptions;
  try {
    std::rethrow_exception(thrown);
  } catch (const Exceptions::BadAllocException&) {
    PyErr_NoMemory();
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

void AddErrors() {
  py::register_exception_translator(&Translate);
}

}  // namespace Aldermoor::Python
