#include "Markup.h"

#include <libxml/xmlstring.h>

#include <filesystem>

namespace curvelab {

namespace {

/// Whether a byte goes on with a character of UTF-8.
bool IsContinuation(char c)
{
    return (static_cast<unsigned char>(c) & 0xc0) == 0x80;
}

} // namespace

std::string Escaped(const std::string& text)
{
    const bool isUtf8 = xmlCheckUTF8(reinterpret_cast<const unsigned char*>(text.c_str())) != 0;
    std::string escaped;
    for (const char c : text) {
        const auto byte = static_cast<unsigned char>(c);
        if (c == '&')
            escaped += "&amp;";
        else if (c == '<')
            escaped += "&lt;";
        else if (c == '"')
            escaped += "&quot;";
        else
            escaped += byte < 0x20 || (byte >= 0x80 && !isUtf8) ? '?' : c;
    }
    return escaped;
}

std::string BaseName(const std::string& name)
{
    const std::filesystem::path path(name);
    return path.has_filename() && name.front() != '-' ? path.filename().string() : name;
}

std::string Shortened(const std::string& text, std::size_t most)
{
    const std::string ellipsis = "\u2026";
    if (text.size() <= most)
        return text;
    const std::size_t room = most > ellipsis.size() ? most - ellipsis.size() : 0;
    std::size_t head = room / 2, tail = text.size() - (room - head);
    while (head > 0 && IsContinuation(text[head]))
        --head;
    while (tail < text.size() && IsContinuation(text[tail]))
        ++tail;
    return text.substr(0, head) + ellipsis + text.substr(tail);
}

} // namespace curvelab
