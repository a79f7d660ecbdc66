#include "jobs.h"

#include <algorithm>
#include <system_error>
#include <thread>
#include <vector>

#include "options.h"

namespace Aldermoor::Tool {

void JobOptions::AddTo(CLI::App& app) {
  AddOption(app, "--jobs", jobs, "N", "Threads that compute; 0 takes as many as the machine runs");
}

void InParallel(const JobOptions& options, std::size_t rows,
                const std::function<void(std::size_t first, std::size_t count)>& work) {
  // Less than this is done before a thread has begun.
  constexpr std::size_t kLeastRows = 4096;
  const unsigned wanted =
      options.jobs != 0 ? options.jobs : std::max(1U, std::thread::hardware_concurrency());
  const std::size_t parts = std::clamp<std::size_t>(rows / kLeastRows, 1, wanted);
  const std::size_t share = (rows + parts - 1) / parts;
  std::vector<std::jthread> threads;
  std::size_t first = 0;
  for (; first + share < rows; first += share) {
    try {
      threads.emplace_back(work, first, share);
    } catch (const std::system_error&) {
      break;  // no further threads to be had: this one does the rest
    }
  }
  work(first, rows - first);
}

}  // namespace Aldermoor::Tool
