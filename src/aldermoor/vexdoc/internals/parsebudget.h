#ifndef ALDERMOOR_VEXDOC_INTERNALS_PARSEBUDGET_H
#define ALDERMOOR_VEXDOC_INTERNALS_PARSEBUDGET_H

#include <cstddef>

#include <xercesc/framework/MemoryManager.hpp>

namespace Aldermoor::Vexdoc::Internals {

/// The memory that one parse may hold at a time, in proportion to the size of its source.
///
/// A DOM takes up to about 50 bytes a byte of text, where elements are as short as can be; a text
/// that wants far more only does so through its DTD, and to no good end.  Must outlive the parser:
/// what the parser has left behind then, as it does where a declaration is broken, is freed here.
class ParseBudget : public xercesc::MemoryManager {
 public:
  static constexpr std::size_t kBaseBytes = std::size_t{32} << 20U;
  static constexpr std::size_t kBytesPerSourceByte = 128;

  explicit ParseBudget(std::size_t source_bytes)
      : limit_(kBaseBytes + source_bytes * kBytesPerSourceByte) {}
  ParseBudget(const ParseBudget&) = delete;
  ParseBudget& operator=(const ParseBudget&) = delete;
  ~ParseBudget() override;

  /// In bytes.
  std::size_t GetLimit() const { return limit_; }
  /// Whether the limit is why memory was refused, and not the system.
  bool IsExceeded() const { return is_exceeded_; }

  /// Throws: xercesc::OutOfMemoryException beyond the limit.
  void* allocate(XMLSize_t size) override;
  void deallocate(void* p) override;
  xercesc::MemoryManager* getExceptionMemoryManager() override;

 private:
  // In front of every block, and the two ends of their ring.
  struct alignas(std::max_align_t) Link {
    Link* former = this;
    Link* next = this;
  };

  std::size_t limit_;
  std::size_t used_ = 0;
  bool is_exceeded_ = false;
  Link blocks_;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_PARSEBUDGET_H
