#include <algorithm>
#include <atomic>
#include <barrier>
#include <thread>

#include <gtest/gtest.h>

#include "aldermoor/measure/context.h"
#include "aldermoor/vexdoc/sample.h"

#include "tests/measure/support.h"

namespace Aldermoor::Measure::Tests {
namespace {

/// What one thread does with its context.
struct Work {
  Conditions target;
  Context context;
  std::vector<float> lab;
  std::vector<float> differences;

  void Run(const std::vector<float>& spectra) {
    lab.resize(spectra.size() / kBands * 3);
    differences.resize(spectra.size() / kBands);
    context.ConvertSpectra(spectra, lab);
    context.CompareSpectra(spectra, std::span(spectra).first(kBands), differences);
  }
};

// Eight threads with conditions of their own beside one that uses the requests of samples, which
// change the weights of the process at every turn.
TEST(ContextThreadsTest, NeedNoLock) {
  constexpr std::size_t kThreads = 8;
  constexpr int kRounds = 20;
  Numbers numbers(8);
  const std::vector<float> spectra = numbers.Spectra(2000);
  const std::vector<Conditions> lights = AllLights();
  std::vector<Work> expected;
  for (std::size_t i = 0; i < kThreads; ++i) {
    Conditions target = lights[5 * i];
    target.AddAttribute(kFormula, i % 2 == 0 ? "2000" : "CMC");
    expected.push_back({target, Context(target), {}, {}});
    expected.back().Run(spectra);
  }

  std::atomic<int> wrong = 0;
  std::atomic<bool> is_over = false;
  std::thread single([&] {
    Vexdoc::Sample sample;
    sample.AddSampleAttribute(Utilities::Tools::SmartPointer<Vexdoc::SampleAttribute>(
        new Vexdoc::Spectrum(Reflectance(std::vector<float>(kBands, 0.5F)))));
    for (std::size_t turn = 0; !is_over; ++turn) {
      const auto color =
          sample.GetSampleAttribute("VEXColorVector", lights[turn % lights.size()], false);
      wrong += color->IsDerived() ? 0 : 1;
    }
  });
  std::vector<std::thread> threads;
  for (const Work& work : expected) {
    threads.emplace_back([&] {
      for (int round = 0; round < kRounds; ++round) {
        // Made here or copied.
        const Context context = round % 2 == 0 ? Context(work.target) : work.context;
        Work own = {{}, context, {}, {}};
        own.Run(spectra);
        const auto equal = [](const std::vector<float>& a, const std::vector<float>& b) {
          return std::equal(a.begin(), a.end(), b.begin(), b.end(),
                            [](float x, float y) { return x == y || (x != x && y != y); });
        };
        wrong += equal(own.lab, work.lab) && equal(own.differences, work.differences) ? 0 : 1;
      }
    });
  }
  for (std::thread& thread : threads) {
    thread.join();
  }
  is_over = true;
  single.join();
  EXPECT_EQ(wrong, 0);
}

// The tables of the process are made by whoever comes first.  Only the first case of a process can
// tell, so this one is to run alone, which ctest does.
TEST(ContextThreadsTest, MayBeTheFirstThatTheProcessDoes) {
  constexpr std::size_t kThreads = 8;
  std::atomic<int> wrong = 0;
  std::barrier start(kThreads);
  std::vector<std::thread> threads;
  for (std::size_t i = 0; i < kThreads; ++i) {
    threads.emplace_back([&, i] {
      start.arrive_and_wait();
      const Conditions target =
          Words({{kIllumination, i % 2 == 0 ? "D50" : "A"}, {kObserver, "TwoDegree"}});
      Work work = {target, Context(target), {}, {}};
      work.Run(std::vector<float>(kBands, 0.5F));
      wrong += work.lab[0] > 70 && work.lab[0] < 80 ? 0 : 1;  // L* of a grey of 50 % is 76
      wrong += work.differences[0] == 0 ? 0 : 1;
    });
  }
  for (std::thread& thread : threads) {
    thread.join();
  }
  EXPECT_EQ(wrong, 0);
}

}  // namespace
}  // namespace Aldermoor::Measure::Tests
