#include "Report.h"

#include "Numbers.h"

#include <nlohmann/json.hpp>

#include <algorithm>
#include <cstddef>

namespace curvelab {

namespace {

using Tree = nlohmann::ordered_json;

/// Calls of one name for all alternatives of a variant.
template <typename... F>
struct Overloaded : F...
{
    using F::operator()...;
};

template <typename... F>
Overloaded(F...) -> Overloaded<F...>;

Tree ToTree(const point2d& p)
{
    return Tree::array({p.x, p.y});
}

Tree ToTree(const Value& value)
{
    return std::visit(Overloaded{[](std::monostate) { return Tree(); }, [](const point2d& p) { return ToTree(p); },
                                 [](const std::vector<point2d>& points) {
                                     Tree list = Tree::array();
                                     for (const point2d& p : points)
                                         list.push_back(ToTree(p));
                                     return list;
                                 },
                                 [](const auto& plain) { return Tree(plain); }},
                      value);
}

Tree ToTree(const Report& report)
{
    Tree object = Tree::object();
    for (const Fact& fact : report.Facts())
        object[fact.key] = ToTree(fact.value);
    return object;
}

} // namespace

std::string Readable(const Value& value)
{
    return std::visit(Overloaded{[](std::monostate) { return std::string("\u2013"); },
                                 [](bool yes) { return std::string(yes ? "yes" : "no"); },
                                 [](std::int64_t count) { return std::to_string(count); },
                                 [](double number) { return FormatNumber(number); },
                                 [](const std::string& text) { return text; },
                                 [](const point2d& p) { return FormatNumber(p.x) + ", " + FormatNumber(p.y); },
                                 [](const auto& list) { return std::to_string(list.size()) + " values"; }},
                      value);
}

std::string Summary(const Report& report, const Paint& paint)
{
    std::size_t width = 0;
    for (const Fact& fact : report.Facts())
        width = std::max(width, fact.label.size());
    std::string text;
    for (const Fact& fact : report.Facts())
        if (!fact.label.empty())
            text +=
                paint.Quiet(fact.label) + std::string(width + 2 - fact.label.size(), ' ') + Readable(fact.value) + '\n';
    return text;
}

std::string Json(const Subject& subject, const Report& report)
{
    Tree root = Tree::object();
    root["command"] = subject.command;
    root["drawing"] = ToTree(subject.drawing);
    root["answer"] = ToTree(report);
    return root.dump(2, ' ', false, Tree::error_handler_t::replace) + '\n';
}

} // namespace curvelab
