#pragma once

#include <algorithm>
#include <cstdio>
#include <string>
#include <vector>

#include "draw/scale.hpp"

namespace quabble::bench {

// The most that may be measured: so many times the limit and so much more.
struct Goal {
    double times = 1;
    double more = 0;
};

inline double quantile(std::vector<double> values, double part) {
    std::ranges::sort(values);
    return values.at(static_cast<std::size_t>(part * static_cast<double>(values.size() - 1)));
}

inline double median(std::vector<double> values) {
    return quantile(std::move(values), 0.5);
}

inline std::string atScale(Scale scale) {
    return scale == Scale() ? "" : " at scale " + std::to_string(scale.quarters() / 4);
}

// Prints a line of the table whose head bench/run prints.
inline void report(const std::string& what, double measured, double limit, const char* unit, Goal goal) {
    char ratio[32] = "-";
    if (limit > 0)
        std::snprintf(ratio, sizeof ratio, "%.2f", measured / limit);
    std::string allowed;
    char part[32];
    if (goal.times != 1) {
        std::snprintf(part, sizeof part, "x %g", goal.times);
        allowed = part;
    }
    if (goal.more != 0 || allowed.empty()) {
        std::snprintf(part, sizeof part, "+ %g %s", goal.more, unit);
        allowed += (allowed.empty() ? "" : " ") + std::string(part);
    }
    const bool isMet = measured <= limit * goal.times + goal.more;
    std::printf("| %-58s | %9.2f %-6s | %9.2f %-6s | %6s | %-14s | %-5s |\n", what.c_str(), measured, unit,
                limit, unit, ratio, allowed.c_str(), isMet ? "ok" : "SHORT");
    std::fflush(stdout);
}

}  // namespace quabble::bench
