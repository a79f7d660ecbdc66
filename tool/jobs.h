#ifndef ALDERMOOR_TOOL_JOBS_H
#define ALDERMOOR_TOOL_JOBS_H

#include <cstddef>
#include <functional>

namespace CLI {
class App;
}

namespace Aldermoor::Tool {

/// The option "--jobs": how many threads compute.
struct JobOptions {
  unsigned jobs = 0;  // 0 stands for as many as the machine runs at once

  void AddTo(CLI::App& app);
};

/// Runs `work(first, count)` over parts of `rows`, in as many threads as are asked for and worth
/// it.  `work` throws nothing.
void InParallel(const JobOptions& options, std::size_t rows,
                const std::function<void(std::size_t first, std::size_t count)>& work);

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_JOBS_H
