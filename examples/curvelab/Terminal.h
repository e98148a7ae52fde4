/// @file
/// Colours for people who read on a terminal, and for nobody else.
#pragma once

#include <string>

namespace curvelab {

/// Whether what is written to a descriptor may carry colours: it has to be a terminal that knows them, and the reader must
/// not have said NO_COLOR.
[[nodiscard]] bool TakesColours(int descriptor);

/// Puts colours into text, or leaves it as it is.
class Paint
{
public:
    explicit Paint(bool isOn) : isOn_(isOn) {}

    [[nodiscard]] std::string Heading(const std::string& text) const;
    [[nodiscard]] std::string Quiet(const std::string& text) const;
    [[nodiscard]] std::string Alarm(const std::string& text) const;

    /// The help, its headings and examples set off.
    [[nodiscard]] std::string Help(const std::string& text) const;

private:
    [[nodiscard]] std::string Wrap(const char* code, const std::string& text) const;

    bool isOn_;
};

} // namespace curvelab
