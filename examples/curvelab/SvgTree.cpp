#include "SvgTree.h"

#include "Failure.h"
#include "Files.h"

#include <libxml/parser.h>

#include <algorithm>
#include <array>
#include <climits>
#include <map>
#include <string_view>
#include <vector>

namespace curvelab {

namespace {

constexpr const char* svgNamespace = "http://www.w3.org/2000/svg";
constexpr const char* xlinkNamespace = "http://www.w3.org/1999/xlink";
/// Twice the depth that the XML parser itself allows; the recursions over the tree fit any stack up to here.
constexpr int maxDepth = 512;
/// A document whose references double at each level stops here.
constexpr int maxCopiedElements = 100000;

const xmlChar* Xml(const char* text)
{
    return reinterpret_cast<const xmlChar*>(text);
}

std::string_view View(const xmlChar* text)
{
    return text ? reinterpret_cast<const char*>(text) : std::string_view();
}

std::string AttributeOf(const xmlNode* element, const char* name, const char* space = nullptr)
{
    xmlChar* value = space ? xmlGetNsProp(element, Xml(name), Xml(space)) : xmlGetNoNsProp(element, Xml(name));
    const std::string text(View(value));
    xmlFree(value);
    return text;
}

void SetAttribute(xmlNode* element, const char* name, const std::string& value)
{
    xmlSetProp(element, Xml(name), Xml(value.c_str()));
}

bool IsSvg(const xmlNode* element, std::string_view name)
{
    return element->type == XML_ELEMENT_NODE && View(element->name) == name && element->ns &&
           View(element->ns->href) == svgNamespace;
}

struct FreeParser
{
    void operator()(xmlParserCtxt* parser) const
    {
        xmlFreeParserCtxt(parser);
    }
};

/// What the parser complains about first; whatever it says later follows from that.
struct Complaint
{
    int line = 0;
    std::string text;
};

/// Has the complaints of a parser noted instead of printed.
void NoteComplaints(xmlParserCtxt* parser, Complaint& first)
{
    parser->_private = &first;
    // The parser hands itself to the call. The constness of the error differs between versions of libxml2.
    parser->sax->serror = [](void* self, auto* error) {
        Complaint& noted = *static_cast<Complaint*>(static_cast<xmlParserCtxt*>(self)->_private);
        if (noted.text.empty() && error->level >= XML_ERR_ERROR)
            noted = {error->line, error->message ? error->message : "an error without a name"};
    };
}

XmlDocument Parse(const std::string& path)
{
    const std::string bytes = ReadFile(path);
    if (bytes.size() > INT_MAX)
        throw Failure(path + ": larger than an XML parser takes");
    const std::unique_ptr<xmlParserCtxt, FreeParser> parser(xmlNewParserCtxt());
    if (!parser)
        throw Failure(path + ": no memory to parse it");
    Complaint complaint;
    NoteComplaints(parser.get(), complaint);
    constexpr int options = XML_PARSE_NONET | XML_PARSE_BIG_LINES;
    XmlDocument document(
        xmlCtxtReadMemory(parser.get(), bytes.data(), static_cast<int>(bytes.size()), nullptr, nullptr, options));
    if (!document)
        throw Failure(path + ": line " + std::to_string(complaint.line) + ": not well-formed XML: " + complaint.text);
    return document;
}

/// Calls f with each element of a tree, parents first.
template <typename F>
void ForEachElement(xmlNode* element, F f)
{
    f(element);
    for (xmlNode* child = element->children; child; child = child->next)
        if (child->type == XML_ELEMENT_NODE)
            ForEachElement(child, f);
}

/// The namespace that elements without one are put into, declared at the root.
xmlNs* SvgNamespaceAt(xmlNode* root)
{
    xmlNs* const known = xmlSearchNsByHref(root->doc, root, Xml(svgNamespace));
    return known ? known : xmlNewNs(root, Xml(svgNamespace), Xml("svg-default"));
}

void AdoptElementsWithoutNamespace(xmlNode* root)
{
    xmlNs* const svg = SvgNamespaceAt(root);
    ForEachElement(root, [svg](xmlNode* element) {
        if (!element->ns)
            xmlSetNs(element, svg);
    });
}

void Remove(xmlNode* node)
{
    xmlUnlinkNode(node);
    xmlFreeNode(node);
}

template <std::size_t N>
bool IsOneOf(const xmlNode* element, const std::array<const char*, N>& names)
{
    return std::any_of(names.begin(), names.end(), [=](const char* name) { return IsSvg(element, name); });
}

/// Keeps the first child of a `switch` that can be drawn. The conditions on the children are those of a renderer without
/// any extension: whatever needs one comes with an alternative that does not.
void KeepFirstDrawnChild(xmlNode* element)
{
    constexpr std::array drawn{"g",    "svg",    "use",  "a",       "switch",   "path",
                               "rect", "circle", "line", "ellipse", "polyline", "polygon"};
    bool found = false;
    for (xmlNode* child = element->children; child;) {
        xmlNode* const next = child->next;
        const bool isFirst = !found && IsOneOf(child, drawn);
        found = found || isFirst;
        if (!isFirst)
            Remove(child);
        child = next;
    }
}

/// Turns links and switches into plain groups.
void SimplifyContainers(xmlNode* root)
{
    ForEachElement(root, [](xmlNode* element) {
        if (IsSvg(element, "switch"))
            KeepFirstDrawnChild(element);
        if (IsSvg(element, "switch") || IsSvg(element, "a"))
            xmlNodeSetName(element, Xml("g"));
    });
}

void SeparateNumbersIn(xmlNode* root)
{
    ForEachElement(root, [](xmlNode* element) {
        for (const char* name : {"d", "points", "transform"})
            if (const std::string value = AttributeOf(element, name); !value.empty())
                SetAttribute(element, name, SeparateNumbers(value));
    });
}

/// Replaces each `use` by <g><svg x y>copy</svg></g>, which draws the same. The inner `svg` moves the copy by lengths in
/// any unit.
class UseExpander
{
public:
    UseExpander(const std::string& path, xmlNode* root) : path_(path)
    {
        ForEachElement(root, [this](xmlNode* element) {
            if (const std::string id = AttributeOf(element, "id"); !id.empty())
                elements_.emplace(id, element);
        });
        Expand(root, 0);
    }

private:
    void Expand(xmlNode* element, int depth);
    void ExpandUse(xmlNode* use, int depth);
    xmlNode* TargetOf(const xmlNode* use) const;
    xmlNode* Copy(const xmlNode* use, xmlNode* target);

    const std::string& path_;
    std::map<std::string, xmlNode*> elements_; ///< by id, the first of each
    std::vector<const xmlNode*> open_;         ///< what the copies around the present place were made of
    int copied_ = 0;
};

/// Containers that are not drawn where they stand.
bool IsDefinition(const xmlNode* element)
{
    return IsOneOf(element, std::array{"defs", "symbol", "clipPath", "mask", "pattern", "marker"});
}

void UseExpander::Expand(xmlNode* element, int depth)
{
    if (IsDefinition(element))
        return;
    if (depth > maxDepth)
        throw Failure(path_ + ": elements are nested deeper than " + std::to_string(maxDepth) + " levels");
    for (xmlNode* child = element->children; child; child = child->next)
        if (IsSvg(child, "use"))
            ExpandUse(child, depth + 1);
        else if (child->type == XML_ELEMENT_NODE)
            Expand(child, depth + 1);
}

void UseExpander::ExpandUse(xmlNode* use, int depth)
{
    xmlNode* const target = TargetOf(use);
    xmlNode* const copy = target ? Copy(use, target) : nullptr;
    while (use->children)
        Remove(use->children);
    xmlNodeSetName(use, Xml("g"));
    if (!copy)
        return;

    xmlNode* const place = xmlNewChild(use, use->ns, Xml("svg"), nullptr);
    SetAttribute(place, "x", AttributeOf(use, "x"));
    SetAttribute(place, "y", AttributeOf(use, "y"));
    xmlAddChild(place, copy);
    open_.push_back(target);
    Expand(use, depth);
    open_.pop_back();
}

/// The element that a `use` refers to; null if there is none in this document, or if it would contain itself.
xmlNode* UseExpander::TargetOf(const xmlNode* use) const
{
    const std::string plain = AttributeOf(use, "href");
    const std::string reference = plain.empty() ? AttributeOf(use, "href", xlinkNamespace) : plain;
    if (reference.empty() || reference[0] != '#')
        return nullptr;
    const auto found = elements_.find(reference.substr(1));
    if (found == elements_.end())
        return nullptr;

    xmlNode* const target = found->second;
    for (const xmlNode* around = use; around; around = around->parent)
        if (around == target)
            return nullptr;
    return std::find(open_.begin(), open_.end(), target) == open_.end() ? target : nullptr;
}

/// A copy of the target as it is drawn in the place of the `use`: `symbol` becomes an `svg`, and takes its size from the
/// `use`, as an `svg` does.
xmlNode* UseExpander::Copy(const xmlNode* use, xmlNode* target)
{
    ForEachElement(target, [this](const xmlNode*) { ++copied_; });
    if (copied_ > maxCopiedElements)
        throw Failure(path_ + ": its <use> references multiply to more than " + std::to_string(maxCopiedElements) +
                      " elements");
    xmlNode* const copy = xmlDocCopyNode(target, target->doc, 1);
    if (IsSvg(copy, "symbol"))
        xmlNodeSetName(copy, Xml("svg"));
    if (IsSvg(copy, "svg"))
        for (const char* name : {"width", "height"})
            if (const std::string size = AttributeOf(use, name); !size.empty())
                SetAttribute(copy, name, size);
    return copy;
}

std::string_view Trimmed(std::string_view text)
{
    constexpr std::string_view blanks = " \t\r\n";
    const std::size_t first = text.find_first_not_of(blanks);
    if (first == std::string_view::npos)
        return {};
    return text.substr(first, text.find_last_not_of(blanks) - first + 1);
}

/// The value of one declaration in a style attribute, the last one if there are several.
std::string DeclaredIn(std::string_view style, std::string_view name)
{
    std::string_view value;
    while (!style.empty()) {
        const std::string_view declaration = style.substr(0, style.find(';'));
        style.remove_prefix(std::min(declaration.size() + 1, style.size()));
        const std::size_t colon = declaration.find(':');
        if (colon != std::string_view::npos && Trimmed(declaration.substr(0, colon)) == name)
            value = Trimmed(declaration.substr(colon + 1));
    }
    return std::string(value.substr(0, value.find_first_of(" !")));
}

bool IsDigit(char c)
{
    return c >= '0' && c <= '9';
}

} // namespace

XmlDocument LoadSvgTree(const std::string& path)
{
    XmlDocument document = Parse(path);
    xmlNode* const root = xmlDocGetRootElement(document.get());
    if (!root)
        throw Failure(path + ": not an SVG drawing, there is no root element");
    AdoptElementsWithoutNamespace(root);
    if (!IsSvg(root, "svg"))
        throw Failure(path + ": not an SVG drawing, the root element is <" + std::string(View(root->name)) + ">");
    SimplifyContainers(root);
    UseExpander(path, root);
    SeparateNumbersIn(root);
    return document;
}

std::string PropertyOf(const xmlNode* element, const std::string& name)
{
    const std::string declared = DeclaredIn(AttributeOf(element, "style"), name);
    return declared.empty() ? std::string(Trimmed(AttributeOf(element, name.c_str()))) : declared;
}

std::string SeparateNumbers(const std::string& text)
{
    std::string separated;
    bool inNumber = false;
    bool pointSeen = false;
    for (std::size_t i = 0; i < text.size(); ++i) {
        const char c = text[i];
        const char before = i > 0 ? text[i - 1] : ' ';
        const bool isExponentSign = (c == '+' || c == '-') && (before == 'e' || before == 'E') && inNumber;
        const bool startsAnew = (c == '.' && pointSeen) || ((c == '+' || c == '-') && !isExponentSign);
        if (inNumber && startsAnew)
            separated += ' ';
        const bool isExponent = (c == 'e' || c == 'E') && inNumber;
        inNumber = IsDigit(c) || c == '.' || c == '+' || c == '-' || isExponent;
        pointSeen = inNumber && !((c == '+' || c == '-') && !isExponentSign) && (pointSeen || c == '.' || isExponent);
        separated += c;
        if (c == '.' && (i + 1 == text.size() || !IsDigit(text[i + 1])))
            separated += '0';
    }
    return separated;
}

} // namespace curvelab
