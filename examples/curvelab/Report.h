/// @file
/// What a command found out: one list of facts that becomes the summary, the legend of the picture and the JSON.
#pragma once

#include "Cubic.h"
#include "Terminal.h"

#include <cstdint>
#include <string>
#include <variant>
#include <vector>

namespace curvelab {

/// A value of the report. The empty alternative is an answer that does not exist, `null` in JSON.
using Value = std::variant<std::monostate, bool, std::int64_t, double, std::string, point2d, std::vector<std::int64_t>,
                           std::vector<double>, std::vector<point2d>>;

/// One fact.
struct Fact
{
    std::string key;   ///< the name in JSON
    std::string label; ///< for people; a fact without one appears in JSON only
    Value value;
};

/// The facts of one run, in the order in which they were added.
class Report
{
public:
    /// A fact for people and programs.
    void Add(const std::string& key, const std::string& label, Value value)
    {
        facts_.push_back({key, label, std::move(value)});
    }

    /// A fact for programs only.
    void AddNumbers(const std::string& key, Value value)
    {
        facts_.push_back({key, "", std::move(value)});
    }

    [[nodiscard]] const std::vector<Fact>& Facts() const
    {
        return facts_;
    }

private:
    std::vector<Fact> facts_;
};

/// A value for people: six significant digits, and a dash for what does not exist.
[[nodiscard]] std::string Readable(const Value& value);

/// The facts with labels, one to a line, the values in one column.
[[nodiscard]] std::string Summary(const Report& report, const Paint& paint);

/// What the report is about; it stands in front of the answer in JSON.
struct Subject
{
    std::string command;
    Report drawing;
};

/// The subject and the facts as a JSON object, doubles to the last bit.
[[nodiscard]] std::string Json(const Subject& subject, const Report& report);

} // namespace curvelab
