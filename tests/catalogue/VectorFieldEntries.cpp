// Fields of a few cells. What grows with a rectangle gets one near the field, as memory grows with it too.
#include "tests/catalogue/Draws.h"

namespace ZarnMath::Catalogue {

namespace {

constexpr int mostCells = 6;
constexpr int farthestOrigin = 1000000;

vector2dT<float, false> DrawCell(Source& in)
{
    const float x = in.Single();
    return {x, in.Single()};
}

/// A field with some of its cells written, at an origin of the drawing.
VectorField DrawField(Source& in, int originX, int originY)
{
    VectorField field;
    const int width = in.Count(0, mostCells);
    const int height = in.Count(0, mostCells);
    field.Initialize(width, height, originX, originY);
    const int writes = in.Count(0, mostCells);
    for (int i = 0; i < writes; ++i) {
        const int column = in.Count(0, mostCells);
        const int row = in.Count(0, mostCells);
        // Near the limits of the integers the last columns wrap, and are not in the field.
        const auto x =
            static_cast<std::int32_t>(static_cast<std::uint32_t>(originX) + static_cast<std::uint32_t>(column));
        const auto y = static_cast<std::int32_t>(static_cast<std::uint32_t>(originY) + static_cast<std::uint32_t>(row));
        field.SetVector(x, y, DrawCell(in));
    }
    return field;
}

VectorField DrawField(Source& in)
{
    const int x = in.Integer();
    const int y = in.Integer();
    return DrawField(in, x, y);
}

VectorField DrawFieldOfDrawing(Source& in)
{
    const int x = in.Count(-farthestOrigin, farthestOrigin);
    const int y = in.Count(-farthestOrigin, farthestOrigin);
    return DrawField(in, x, y);
}

/// A rectangle about a field's origin, inside out at times.
RECT DrawRectNear(Source& in, const VectorField& field)
{
    const auto near = [&in](int origin) { return origin + in.Count(-mostCells, 2 * mostCells); };
    return {near(field.originX), near(field.originY), near(field.originX), near(field.originY)};
}

constexpr auto changedField = [](Draft& draft) { return Changed<VectorField>{DrawField(draft.in)}; };
constexpr auto givenField = [](Draft& draft) { return Given<VectorField>{DrawField(draft.in)}; };

void AddBoundsOfFields(Family& family)
{
    family.AddMember<VectorField, void(int, int, int, int)>("VectorField::Initialize", &VectorField::Initialize,
                                                            changedField, count<-1, mostCells>, count<-1, mostCells>,
                                                            integer, integer);
    family.AddBody("VectorField::Initialize(const RECT&)", [](Source& in, Sink& out) {
        VectorField field = DrawFieldOfDrawing(in);
        field.Initialize(DrawRectNear(in, field));
        out.Put(field);
    });
    family.AddMember<VectorField, void()>("VectorField::ClearVectors", &VectorField::ClearVectors, changedField);
    family.AddBody("VectorField::Rebound(const RECT&)", [](Source& in, Sink& out) {
        VectorField field = DrawFieldOfDrawing(in);
        out.Put(field.Rebound(DrawRectNear(in, field)));
        out.Put(field);
    });
    family.AddBody("VectorField::Extend(const RECT&)", [](Source& in, Sink& out) {
        VectorField field = DrawFieldOfDrawing(in);
        out.Put(field.Extend(DrawRectNear(in, field)));
        out.Put(field);
    });
    family.AddMember<VectorField, RECT() const>("VectorField::GetZGIRECT", &VectorField::GetZGIRECT, givenField);
}

void AddBlocks(Family& family)
{
    family.AddBody("VectorField::Blit(const VectorField&, int, int)", [](Source& in, Sink& out) {
        VectorField field = DrawField(in);
        const VectorField source = in.Flag() ? DrawField(in, field.originX, field.originY) : DrawField(in);
        const int dx = in.Flag() ? in.Count(-mostCells, mostCells) : in.Integer();
        const int dy = in.Flag() ? in.Count(-mostCells, mostCells) : in.Integer();
        out.Put(field.Blit(source, dx, dy));
        out.Put(field);
    });
    family.AddBody("VectorField::BlitExtend(const VectorField&, int, int)", [](Source& in, Sink& out) {
        VectorField field = DrawFieldOfDrawing(in);
        const int x = field.originX + in.Count(-mostCells, 2 * mostCells);
        const int y = field.originY + in.Count(-mostCells, 2 * mostCells);
        const VectorField source = DrawField(in, x, y);
        const int dx = in.Count(-mostCells, mostCells);
        const int dy = in.Count(-mostCells, mostCells);
        out.Put(field.BlitExtend(source, dx, dy));
        out.Put(field);
    });
    family.AddBody("VectorField::GetRegion(const RECT&)", [](Source& in, Sink& out) {
        VectorField field = DrawFieldOfDrawing(in);
        const RECT region = in.Flag() ? DrawRectNear(in, field) : in.Rect();
        out.Put(field.GetRegion(region));
        out.Put(field);
    });
}

/// In the field or up to two cells outside it, between the cells too; or anywhere.
float DrawPlace(Source& in, int origin)
{
    if (in.Flag())
        return in.Single();
    const auto cell = static_cast<float>(in.Count(-2, mostCells + 2));
    return static_cast<float>(origin) + (cell + static_cast<float>(in.Count(0, 8)) * 0.125F);
}

void AddCells(Family& family)
{
    family.AddBody("VectorField::Get(vector2dT<float, true>) const", [](Source& in, Sink& out) {
        VectorField field = DrawField(in);
        if (field.height < 2)
            field.Initialize(2, 2, field.originX, field.originY);
        const float x = DrawPlace(in, field.originX);
        const float y = DrawPlace(in, field.originY);
        out.Put(field.Get({x, y}));
    });
    family.AddBody("VectorField::VectorField(VectorField&&)", [](Source& in, Sink& out) {
        VectorField source = DrawField(in);
        const VectorField field(std::move(source));
        out.Put(field);
    });
    family.AddBody("VectorField::operator=(VectorField&&)", [](Source& in, Sink& out) {
        VectorField field = DrawField(in);
        field = DrawField(in);
        out.Put(field);
    });
}

} // namespace

void AddVectorField(std::vector<Function>& list)
{
    Family family(list, "VectorField");
    AddBoundsOfFields(family);
    AddBlocks(family);
    AddCells(family);
}

} // namespace ZarnMath::Catalogue
