#include "bench/paired_rounds.h"

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <ctime>
#include <sys/resource.h>
#include <unistd.h>

namespace {

struct Times {
  double cpu = 0, wall = 0;
};

double Seconds(const timeval &time) {
  return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_usec) * 1e-6;
}

// This process's CPU time and that of the child processes it waited for.
double CpuSeconds() {
  timespec now{};
  clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &now);
  rusage children{};
  getrusage(RUSAGE_CHILDREN, &children);
  return static_cast<double>(now.tv_sec) + static_cast<double>(now.tv_nsec) * 1e-9 +
         Seconds(children.ru_utime) + Seconds(children.ru_stime);
}

double WallSeconds() {
  using Clock = std::chrono::steady_clock;
  return std::chrono::duration<double>(Clock::now().time_since_epoch()).count();
}

Times Time(const Side &side) {
  side.prepare();
  // What the preparation wrote must not be flushed on our time.
  ::sync();
  const double cpu = CpuSeconds(), wall = WallSeconds();
  side.run();
  return {CpuSeconds() - cpu, WallSeconds() - wall};
}

double Median(std::vector<double> values) {
  std::sort(values.begin(), values.end());
  const size_t middle = values.size() / 2;
  return values.size() % 2 ? values[middle] : (values[middle - 1] + values[middle]) / 2;
}

std::string Fixed(double value) {
  char text[32];
  std::snprintf(text, sizeof text, "%.2f", value);
  return text;
}

} // namespace

PairedResult RunPairs(int pairs, const Side &ours, const Side &baseline) {
  PairedResult result;
  std::vector<double> oursWall, baselineWall;
  for (int pair = 0; pair < pairs; ++pair) {
    Times mine, plain;
    if (pair % 2 == 0) {
      mine = Time(ours);
      plain = Time(baseline);
    } else {
      plain = Time(baseline);
      mine = Time(ours);
    }
    result.cpuRatios.push_back(mine.cpu / plain.cpu);
    result.wallRatios.push_back(mine.wall / plain.wall);
    oursWall.push_back(mine.wall);
    baselineWall.push_back(plain.wall);
  }
  result.oursMs = Median(oursWall) * 1000;
  result.baselineMs = Median(baselineWall) * 1000;
  return result;
}

void PrintHeading(const std::string &title) {
  std::printf("\n%s\n%-58s %9s %9s %22s %22s\n", title.c_str(), "work", "ours ms", "base ms",
              "CPU ratio [spread]", "elapsed ratio [spread]");
}

void PrintResult(const std::string &work, const PairedResult &result, double aim) {
  const auto [cpuLow, cpuHigh] =
      std::minmax_element(result.cpuRatios.begin(), result.cpuRatios.end());
  const auto [wallLow, wallHigh] =
      std::minmax_element(result.wallRatios.begin(), result.wallRatios.end());
  const double cpu = Median(result.cpuRatios);
  const std::string verdict = aim <= 0     ? "(for information)"
                              : cpu <= aim ? "aim " + Fixed(aim) + "x met"
                                           : "aim " + Fixed(aim) + "x NOT MET";
  std::printf("%-58s %9.1f %9.1f %6.2fx [%.2f-%.2f] %6.2fx [%.2f-%.2f]  %s\n", work.c_str(),
              result.oursMs, result.baselineMs, cpu, *cpuLow, *cpuHigh, Median(result.wallRatios),
              *wallLow, *wallHigh, verdict.c_str());
  std::fflush(stdout);
}
