#include "bench/Rows.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <map>
#include <nlohmann/json.hpp>
#include <utility>
#include <vector>

namespace Corvane::Bench {
namespace {

/// A noisy machine needs many short looks more than a few long ones.
constexpr int repetitions = 21;
constexpr int slowRepetitions = 5;
constexpr double secondsEach = 0.02;

std::vector<Row> rows;
std::string selection;

/// The benchmarks of one row, in the form that a filter takes.
std::string prefixOf(std::size_t index) {
  std::string prefix = "#";
  prefix += std::to_string(index);
  prefix += '/';
  return prefix;
}

/// Collects the times of every repetition; prints nothing.
class Samples : public benchmark::BenchmarkReporter {
 public:
  explicit Samples(bool wallClock) : wallClock_(wallClock) {}

  bool ReportContext(const Context& /*context*/) override { return true; }

  void ReportRuns(const std::vector<Run>& runs) override {
    for (const Run& run : runs) {
      if (run.run_type == Run::RT_Iteration) {
        const double time = wallClock_ ? run.GetAdjustedRealTime() : run.GetAdjustedCPUTime();
        times_[run.run_name.function_name.ends_with("/floor") ? 1 : 0].push_back(time);
      }
    }
  }

  double operation() { return median(times_[0]); }
  double floor() { return median(times_[1]); }

 private:
  static double median(std::vector<double>& times) {
    const auto middle = times.begin() + static_cast<std::ptrdiff_t>(times.size() / 2);
    std::nth_element(times.begin(), middle, times.end());
    return middle == times.end() ? 0 : *middle;
  }

  bool wallClock_;
  std::vector<double> times_[2];
};

struct Measurement {
  double operation;
  double floor;

  double ratio() const { return operation / floor; }
};

/// Repetitions of operation and floor take turns at random, so that a slow minute of the machine hits both.
Measurement measure(std::size_t index) {
  Samples samples(rows[index].wallClock);
  benchmark::RunSpecifiedBenchmarks(&samples, prefixOf(index));
  return {samples.operation(), samples.floor()};
}

void printHeading(const std::string& abi) {
  std::printf("%s\n%-74s %14s %14s %7s %6s  %s\n", abi.c_str(), "operation", "time ns", "floor ns", "ratio", "limit",
              "growth");
}

void printRow(const Row& row, const Measurement& measured, const std::map<std::string, Measurement>& earlier) {
  std::printf("%-74s %14.1f %14.1f %7.2f ", row.name.c_str(), measured.operation, measured.floor, measured.ratio());
  if (row.limit) {
    std::printf("%6.2f", *row.limit);
  } else {
    std::printf("%6s", "-");
  }
  if (const auto smaller = earlier.find(row.smaller); smaller != earlier.end()) {
    std::printf("  x %.1f", measured.operation / smaller->second.operation);
  }
  std::puts(row.limit && measured.ratio() > *row.limit ? "  OVER THE LIMIT" : "");
  std::fflush(stdout);
}

void printJson(const std::string& abi, const Row& row, const Measurement& measured) {
  nlohmann::ordered_json line = {
      {"name", row.name}, {"ns", measured.operation}, {"floor_ns", measured.floor}, {"ratio", measured.ratio()}};
  line["limit"] = row.limit ? nlohmann::ordered_json(*row.limit) : nlohmann::ordered_json();
  line["abi"] = abi;
  std::printf("%s\n", line.dump().c_str());
  std::fflush(stdout);
}

}  // namespace

void selectRows(std::string part) {
  selection = std::move(part);
}

bool selected(const std::string& name) {
  return name.find(selection) != std::string::npos;
}

namespace detail {

std::string keepRow(Row row) {
  rows.push_back(std::move(row));
  return prefixOf(rows.size() - 1);
}

void configure(const Row& row, benchmark::internal::Benchmark* benchmark) {
  benchmark->MinTime(secondsEach)->Repetitions(row.slow ? slowRepetitions : repetitions);
  if (row.wallClock) {
    benchmark->UseRealTime();
  }
}

}  // namespace detail

void require(bool condition, const char* subject, const char* expectation) {
  if (!condition) {
    std::fprintf(stderr, "corvane_bench: this should hold and does not: %s %s\n", subject, expectation);
    std::exit(1);
  }
}

void runRows(const std::string& abi, bool json) {
  std::map<std::string, Measurement> done;
  if (!json) {
    printHeading(abi);
  }
  for (std::size_t index = 0; index < rows.size(); ++index) {
    const Row& row = rows[index];
    const Measurement measured = measure(index);
    if (json) {
      printJson(abi, row, measured);
    } else {
      printRow(row, measured, done);
    }
    done.emplace(row.name, measured);
  }
}

}  // namespace Corvane::Bench
