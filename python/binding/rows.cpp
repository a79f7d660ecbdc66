#include "rows.h"

#include <algorithm>
#include <cstdint>
#include <functional>
#include <string>
#include <vector>

#include <pybind11/stl.h>

namespace Aldermoor::Python {
namespace {

namespace py = pybind11;

constexpr py::ssize_t kFloat = sizeof(float);

std::string Text(const py::handle& object) {
  return py::str(object).cast<std::string>();
}

bool IsMasked(const py::object& array) {
  return !py::type::of(array).is(py::module_::import("numpy").attr("ndarray")) &&
         py::isinstance(array, py::module_::import("numpy.ma").attr("MaskedArray"));
}

// The array that `value` is.
py::array FloatArray(const std::string& argument, const py::object& value,
                     const std::string& shape) {
  const std::string expected = argument + ": expected a NumPy array of float32 with shape " + shape;
  if (!py::isinstance<py::array>(value)) {
    throw py::type_error(expected + ", got " + Text(py::type::of(value).attr("__name__")));
  }
  if (IsMasked(value)) {
    throw py::type_error(expected + ", got one with a mask; fill it with .filled(numpy.nan)");
  }
  auto array = py::reinterpret_borrow<py::array>(value);
  if (!py::isinstance<py::array_t<float>>(value)) {
    throw py::type_error(expected + ", got " + Text(array.dtype()) + " with shape " +
                         Text(array.attr("shape")) + "; convert it with .astype(numpy.float32)");
  }
  return array;
}

[[noreturn]] void FailShape(const std::string& argument, const std::string& shape,
                            const py::array& array) {
  throw py::value_error(argument + ": expected shape " + shape + ", got " +
                        Text(array.attr("shape")));
}

bool IsAligned(const py::array& array) {
  return reinterpret_cast<std::uintptr_t>(array.data()) % alignof(float) == 0;
}

bool IsReadInPlace(const py::array& array, std::size_t width, Rows::Layout layout) {
  const py::ssize_t last = array.ndim() - 1;
  if (!IsAligned(array) || array.strides(last) != kFloat) {
    return false;
  }
  if (last == 0 || array.shape(0) <= 1) {
    return true;
  }
  const py::ssize_t stride = array.strides(0);
  return layout == Rows::Layout::kAnyStride ? stride > 0 && stride % kFloat == 0
                                            : stride == static_cast<py::ssize_t>(width) * kFloat;
}

}  // namespace

Rows::Rows(const char* argument, const py::object& value, std::size_t width, Layout layout)
    : width_(width), count_(1), stride_(width) {
  const std::string columns = std::to_string(width);
  const std::string shape = "(n, " + columns + ") or (" + columns + ",)";
  array_ = FloatArray(argument, value, shape);
  const py::ssize_t axes = array_.ndim();
  if (axes < 1 || axes > 2 || array_.shape(axes - 1) != static_cast<py::ssize_t>(width)) {
    FailShape(argument, shape, array_);
  }
  if (!IsReadInPlace(array_, width, layout)) {
    array_ = array_.attr("copy")("C");
  }
  if (axes == 2) {
    count_ = static_cast<std::size_t>(array_.shape(0));
    if (count_ > 1) {
      stride_ = static_cast<std::size_t>(array_.strides(0) / kFloat);
    }
  }
}

std::span<const float> Rows::GetValues() const {
  const std::size_t size = count_ == 0 ? 0 : (count_ - 1) * stride_ + width_;
  return {static_cast<const float*>(array_.data()), size};
}

std::span<const float> Rows::GetRow(std::size_t row) const {
  return GetValues().subspan(row * stride_, width_);
}

py::array_t<float> MakeResult(const py::object& out, std::size_t count, bool single,
                              std::size_t width) {
  std::vector<py::ssize_t> shape;
  if (!single) {
    shape.push_back(static_cast<py::ssize_t>(count));
  }
  if (width > 0) {
    shape.push_back(static_cast<py::ssize_t>(width));
  }
  if (out.is_none()) {
    return py::array_t<float>(shape);
  }
  const std::string expected = Text(py::tuple(py::cast(shape)));
  const py::array array = FloatArray("out", out, expected);
  if (!std::equal(shape.begin(), shape.end(), array.shape(), array.shape() + array.ndim())) {
    FailShape("out", expected, array);
  }
  if (!array.writeable() || (array.flags() & py::array::c_style) == 0 || !IsAligned(array)) {
    throw py::value_error("out: expected an array that is writeable and C-contiguous");
  }
  return py::reinterpret_borrow<py::array_t<float>>(array);  // itself, of whatever subclass
}

std::span<float> ValuesOf(py::array_t<float>& result) {
  return {result.mutable_data(), static_cast<std::size_t>(result.size())};
}

void CheckApart(const py::array_t<float>& result, const Rows& rows) {
  const std::span<const float> read = rows.GetValues();
  const float* const written = result.data();
  const std::less<const float*> less;
  if (!read.empty() && result.size() > 0 && less(written, read.data() + read.size()) &&
      less(read.data(), written + result.size())) {
    throw py::value_error("out: overlaps what is read");
  }
}

}  // namespace Aldermoor::Python
