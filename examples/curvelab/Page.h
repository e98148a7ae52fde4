/// @file
/// A page about a drawing: one HTML file that needs no other, for light and dark.
#pragma once

#include "Report.h"
#include "Timings.h"

#include <string>
#include <vector>

namespace curvelab {

/// One question with its answer.
struct Chapter
{
    std::string id; ///< one word; the picture was rendered with it
    std::string heading;
    std::string remark; ///< a sentence on what there is to see
    std::string figure; ///< SVG
    Report report;
    std::string command; ///< that shows the same
    double seconds;      ///< with curvelab's own checks
};

/// A page in the making.
class Page
{
public:
    explicit Page(std::string name) : name_(std::move(name)) {}

    /// The artwork by itself, and the facts of all chapters that matter most.
    void SetOverview(std::string figure, Report report);

    void Add(Chapter chapter);

    void SetTimings(std::vector<Timing> timings);

    [[nodiscard]] std::string Html() const;

private:
    [[nodiscard]] std::string Overview() const;
    [[nodiscard]] std::string Contents() const;
    [[nodiscard]] std::string TimingTable() const;

    std::string name_;
    std::string figure_;
    Report report_;
    std::vector<Chapter> chapters_;
    std::vector<Timing> timings_;
};

} // namespace curvelab
