/// What a history says about a production.
#pragma once

#include <chrono>
#include <map>
#include <optional>
#include <span>
#include <string>
#include <vector>

#include "records/run.h"

namespace factory_test {

/// Units are counted by their newest finished run. One passed when that run gave every test of its
/// plan a PASS in the end; at first, when no run ever gave it a FAIL, nor was a
/// test begun anew. A run without a serial number
/// is a unit of its own.
struct Yield {
  int units = 0;
  int passed = 0;
  int passedAtFirst = 0;

  void add(const Yield& other);
};

struct TestCount {
  std::string test = {};
  int verdicts = 0;  // PASS or FAIL
  int fails = 0;
};

struct ValuePoint {
  std::chrono::sys_seconds time = {};
  double value = 0;
  bool isWithin = true;
};

/// What a test measured under one name, oldest first.
struct ValueSeries {
  std::string test = {};
  Measure newest = {};  // its name, unit and limits
  std::vector<ValuePoint> points = {};
};

struct Statistics {
  int runs = 0;
  int aborted = 0;
  int rehearsals = 0;  // runs that nothing else here counts
  Yield total = {};
  std::map<std::string, Yield> days = {};  // by "2026-11-21", UTC
  std::map<std::string, Yield> stations = {};
  std::vector<TestCount> tests = {};     // most fails first
  std::vector<ValueSeries> values = {};  // by test and name
};

/// `runs`, oldest first.
Statistics statisticsOf(std::vector<RunRecord> runs);

/// Figures of a series, which has a point at least.
struct Spread {
  double least = 0;
  double most = 0;
  double mean = 0;
  double median = 0;
  double deviation = 0;                   // of a sample; 0 for one point
  int outside = 0;                        // of the limits that each was judged by
  std::optional<double> capability = {};  // Cpk by the newest limits, where it can be said
};
Spread spreadOf(const ValueSeries& series);

}  // namespace factory_test
