#include "tests/vectors/FieldValues.h"
#include "tests/vectors/Table.h"

namespace ZarnMath::Vectors {

namespace {

using Vector = vector2dT<float, false>;

void InitializeFromSizes(Input& in, Output& out)
{
    auto field = in.Get<VectorField>();
    const auto sizes = in.GetArray<int, 4>();
    field.Initialize(sizes[0], sizes[1], sizes[2], sizes[3]);
    out.Add(field);
}

void InitializeFromRect(Input& in, Output& out)
{
    auto field = in.Get<VectorField>();
    field.Initialize(in.Get<RECT>());
    out.Add(field);
}

void AddBounding(Table& table, const std::string& name, bool (VectorField::*bound)(const RECT&))
{
    table.Add("VectorField::" + name, [bound](Input& in, Output& out) {
        auto field = in.Get<VectorField>();
        const bool result = (field.*bound)(in.Get<RECT>());
        out.Add(result, field);
    });
}

void AddBlit(Table& table, const std::string& name, bool (VectorField::*blit)(const VectorField&, int, int))
{
    table.Add("VectorField::" + name, [blit](Input& in, Output& out) {
        auto field = in.Get<VectorField>();
        const auto source = in.Get<VectorField>();
        const int dx = in.Get<int>();
        const bool result = (field.*blit)(source, dx, in.Get<int>());
        out.Add(result, field, source);
    });
}

void Sample(Input& in, Output& out)
{
    const auto field = in.Get<VectorField>();
    out.Add(field.Get(in.Get<vector2dT<float, true>>()));
}

void CutRegion(Input& in, Output& out)
{
    auto field = in.Get<VectorField>();
    const VectorField region = field.GetRegion(in.Get<RECT>());
    out.Add(region, field);
}

void WriteCell(Input& in, Output& out)
{
    auto field = in.Get<VectorField>();
    const int x = in.Get<int>();
    const int y = in.Get<int>();
    field.SetVector(x, y, in.Get<Vector>());
    out.Add(field);
}

void ReadCell(Input& in, Output& out)
{
    const auto field = in.Get<VectorField>();
    const int x = in.Get<int>();
    out.Add(field.GetVector(x, in.Get<int>()));
}

void Copy(Input& in, Output& out)
{
    const auto source = in.Get<VectorField>();
    const VectorField copy = source;
    out.Add(copy, source);
}

void MoveConstruct(Input& in, Output& out)
{
    auto source = in.Get<VectorField>();
    const VectorField target(std::move(source));
    out.Add(target, source);
}

void MoveAssign(Input& in, Output& out)
{
    auto source = in.Get<VectorField>();
    VectorField target;
    target.Initialize(3, 2, 40, 50);
    target.SetVector(41, 51, {1.0F, 2.0F});
    target = std::move(source);
    out.Add(target, source);
}

} // namespace

void AddVectorFieldAdapters(Table& table)
{
    table.Add("VectorField::Initialize(sizes)", InitializeFromSizes);
    table.Add("VectorField::Initialize(RECT)", InitializeFromRect);
    table.Add("VectorField::ClearVectors", [](Input& in, Output& out) {
        auto field = in.Get<VectorField>();
        field.ClearVectors();
        out.Add(field);
    });
    AddBounding(table, "Rebound", &VectorField::Rebound);
    AddBounding(table, "Extend", &VectorField::Extend);
    AddBlit(table, "Blit", &VectorField::Blit);
    AddBlit(table, "BlitExtend", &VectorField::BlitExtend);
    table.Add("VectorField::Get", Sample);
    table.Add("VectorField::GetRegion", CutRegion);
    table.Add("VectorField::GetZGIRECT", [](Input& in, Output& out) { out.Add(in.Get<VectorField>().GetZGIRECT()); });
    table.Add("VectorField::SetVector", WriteCell);
    table.Add("VectorField::GetVector", ReadCell);
    table.Add("VectorField::copy", Copy);
    table.Add("VectorField::move construction", MoveConstruct);
    table.Add("VectorField::move assignment", MoveAssign);
}

} // namespace ZarnMath::Vectors
