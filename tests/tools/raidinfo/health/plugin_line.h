#pragma once

#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

namespace raidinfo::test {

// The output of a monitoring plugin, after the published guidelines for plugins:
//
//   line        = service blank state " - " text [" | " data]
//   state       = "OK" / "WARNING" / "CRITICAL" / "UNKNOWN"
//   text        = any characters but the bar and line breaks
//   data        = measurement *(blank measurement)
//   measurement = label "=" value [unit] [";" [range] [";" [range] [";" [number] [";" [number]]]]]
//   label       = 1*(any character but blank, quote, "=" and bar)
//               / quote 1*(any character but quote, "=" and bar) quote
//   unit        = "s" / "ms" / "us" / "%" / "B" / "KB" / "MB" / "GB" / "TB" / "c"
//   range       = ["@"] [start ":"] [number]     ; start = number / "~"; not empty
//   number      = ["-"] 1*digit ["." 1*digit]
struct PluginMeasurement {
    std::string label;
    double value;
    std::string unit;
    std::string warning, critical, minimum, maximum;
};

struct PluginLine {
    std::string service;
    std::string state;
    std::string text;
    std::vector<PluginMeasurement> data;
};

class NoPluginLine : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// Throws NoPluginLine for what is not in the grammar.
[[nodiscard]] PluginLine parsedPluginLine(std::string_view output);

// Whether a value lies where a range asks for an alert.
[[nodiscard]] bool alerts(const std::string& range, double value);

}  // namespace raidinfo::test
