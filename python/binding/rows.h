#ifndef ALDERMOOR_PYTHON_ROWS_H
#define ALDERMOOR_PYTHON_ROWS_H

#include <cstddef>
#include <span>

#include <pybind11/numpy.h>

/// NumPy arrays as the library reads and writes them: float32, one row behind the other.
namespace Aldermoor::Python {

/// An array that is read: one row, of shape (width), or many, of shape (n, width).
///
/// What lies in memory as it is needed is read in its place, everything else from a copy.
class Rows {
 public:
  /// How far apart rows may be.
  enum class Layout { kDense, kAnyStride };

  /// Throws: TypeError for another type, ValueError for another shape; both name `argument`.
  Rows(const char* argument, const pybind11::object& value, std::size_t width, Layout layout);

  std::size_t GetCount() const { return count_; }
  /// Floats from the start of one row to that of the next.
  std::size_t GetStride() const { return stride_; }
  /// Whether the array has the axis of rows.
  bool IsSingle() const { return array_.ndim() == 1; }
  std::span<const float> GetValues() const;
  std::span<const float> GetRow(std::size_t row) const;

 private:
  pybind11::array array_;
  std::size_t width_;
  std::size_t count_;
  std::size_t stride_;
};

/// The array for results: `out`, or a new one if that is None.  It has `count` rows of `width`
/// numbers, or of one number without an axis of its own for a width of 0; without the axis of rows
/// if it is `single`.
/// Throws: TypeError, ValueError if `out` is another array.
pybind11::array_t<float> MakeResult(const pybind11::object& out, std::size_t count, bool single,
                                    std::size_t width);

/// The memory of a result.
std::span<float> ValuesOf(pybind11::array_t<float>& result);

/// Throws: ValueError if what is written touches what is read.
void CheckApart(const pybind11::array_t<float>& result, const Rows& rows);

}  // namespace Aldermoor::Python

#endif  // ALDERMOOR_PYTHON_ROWS_H
