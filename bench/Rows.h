#ifndef CORVANE_BENCH_ROWS_H
#define CORVANE_BENCH_ROWS_H

#include <benchmark/benchmark.h>

#include <optional>
#include <string>

/// The lines of the report: an operation of the product beside its floor, the least that the same
/// answer could cost.
namespace Corvane::Bench {

struct Row {
  std::string name;
  /// The largest ratio of operation to floor that is accepted; none: the ratio is only reported.
  std::optional<double> limit = {};
  /// The row of the same operation on the next smaller machine; its growth is shown.
  std::string smaller = {};
  /// Measured by the wall clock instead of the processor time, for what other processes do.
  bool wallClock = false;
  /// Takes seconds, so it is repeated less.
  bool slow = false;
};

/// Only rows whose names contain `part` are wanted; the rest are left out when they are added.
void selectRows(std::string part);

/// Whether the row is wanted, for what is costly to prepare.
bool selected(const std::string& name);

namespace detail {

/// Keeps the row and returns the prefix of the names of its two benchmarks.
std::string keepRow(Row row);

/// How the row's benchmarks are repeated and timed.
void configure(const Row& row, benchmark::internal::Benchmark* benchmark);

template <class Work>
void measure(const Row& row, const std::string& name, Work work) {
  configure(row, benchmark::RegisterBenchmark(name.c_str(), [work](benchmark::State& state) mutable {
              for ([[maybe_unused]] auto iteration : state) {
                work();
              }
            }));
}

}  // namespace detail

/// Adds a line; `operation` and `floor` are callables without arguments, each one run of its work.
template <class Operation, class Floor>
void addRow(const Row& row, Operation operation, Floor floor) {
  if (!selected(row.name)) {
    return;
  }
  const std::string prefix = detail::keepRow(row);
  detail::measure(row, prefix + "operation", operation);
  detail::measure(row, prefix + "floor", floor);
}

/// Measures the rows and prints each as it is done: a table, or one JSON object per line.
void runRows(const std::string& abi, bool json);

/// A measurement of a wrong answer is worth nothing: ends the program with a message unless `condition` holds.
void require(bool condition, const char* subject, const char* expectation = "");

void addLogRows();
void addCollectionRows();
void addProviderRows();
void addTreeRows();
void addSmbiosRows();
void addProcessRows();

}  // namespace Corvane::Bench

#endif
