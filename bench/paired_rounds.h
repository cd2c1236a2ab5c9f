#pragma once

#include <functional>
#include <string>
#include <vector>

// One side of a comparison: `prepare` sets up the starting point (not timed), `run` is timed.
struct Side {
  std::function<void()> prepare;
  std::function<void()> run;
};

// How one side compared with its baseline over paired rounds.
struct PairedResult {
  std::vector<double> cpuRatios;     // ours / baseline in process CPU time, one per pair
  std::vector<double> wallRatios;    // the same in elapsed time
  double oursMs = 0, baselineMs = 0; // median elapsed times
};

// Runs `pairs` rounds of ours and the baseline back to back, alternating which goes first, so
// that drift of the machine falls on both alike.
PairedResult RunPairs(int pairs, const Side &ours, const Side &baseline);

// Prints one line: what was compared, the median times, the median CPU and elapsed ratios with
// their spread (lowest to highest), and whether the median CPU ratio is within `aim` (0 for a
// figure shown for information).
void PrintResult(const std::string &work, const PairedResult &result, double aim);
// The heading over the lines PrintResult prints.
void PrintHeading(const std::string &title);
