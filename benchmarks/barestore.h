#ifndef ALDERMOOR_BENCHMARKS_BARESTORE_H
#define ALDERMOOR_BENCHMARKS_BARESTORE_H

#include <memory>
#include <string>

#include "aldermoor/vexdoc/vex.h"

/// The least that saving a document and loading its cache can cost: the same bytes, the same nodes,
/// and nothing decided on the way.
namespace Aldermoor::Benchmarks {

/// A tree of the same containers with the same number and size of nodes as a document whose samples
/// hold spectra.
class BareTree {
 public:
  explicit BareTree(const Vexdoc::VEX& model);
  BareTree(const BareTree&) = delete;
  BareTree& operator=(const BareTree&) = delete;
  ~BareTree();

 private:
  struct Node;
  std::unique_ptr<Node> root_;
};

/// Builds the DOM of such a document with the texts at hand and serialises it to memory.
/// Returns the number of bytes.
std::size_t SerialiseBareDom(const Vexdoc::VEX& model);

/// Writes `bytes` beside `path`, flushes them to disk and renames the file.
/// Throws: std::runtime_error.
void WriteBareFile(const std::string& path, const std::string& bytes);

}  // namespace Aldermoor::Benchmarks

#endif  // ALDERMOOR_BENCHMARKS_BARESTORE_H
