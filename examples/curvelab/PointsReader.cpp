#include "PointsReader.h"

#include "Failure.h"
#include "Files.h"
#include "Numbers.h"

#include <algorithm>
#include <filesystem>
#include <optional>
#include <sstream>

namespace curvelab {

namespace {

/// The point of a line, or nothing for one that is empty but for remarks.
///
/// @param place the file and the line, for the message
std::optional<point2d> PointOf(std::string line, const std::string& place)
{
    line.erase(std::min(line.find('#'), line.size()));
    for (char& c : line)
        if (c == ',')
            c = ' ';
    std::istringstream words(line);
    std::string x;
    std::string y;
    std::string surplus;
    if (!(words >> x))
        return std::nullopt;
    if (!(words >> y) || words >> surplus)
        throw Failure(place + ": a point has two numbers");
    return point2d{ReadNumber(place, x), ReadNumber(place, y)};
}

void AddPolyline(std::vector<point2d>& points, Pen& pen)
{
    if (points.empty())
        return;
    const bool isClosed = points.size() > 2 && points.front() == points.back();
    if (isClosed)
        points.pop_back();
    pen.MoveTo(points.front());
    for (const point2d& p : points)
        pen.LineTo(p);
    if (isClosed)
        pen.Close();
    points.clear();
}

} // namespace

bool IsListOfPoints(const std::string& path)
{
    return std::filesystem::path(path).extension() == ".txt";
}

Drawing ReadPoints(const std::string& path)
{
    Drawing drawing;
    drawing.name = path;
    std::istringstream lines(ReadFile(path));
    std::vector<point2d> points;
    Pen pen;
    std::string line;
    for (int number = 1; std::getline(lines, line); ++number) {
        if (const auto p = PointOf(line, path + ": line " + std::to_string(number)))
            points.push_back(*p);
        else
            AddPolyline(points, pen);
    }
    AddPolyline(points, pen);
    AddShape(drawing, {.filled = false, .evenOdd = false}, pen.Finish());
    return drawing;
}

} // namespace curvelab
