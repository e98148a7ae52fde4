#include "tests/vectors/FieldValues.h"
#include "tests/vectors/Table.h"

namespace ZarnMath::Vectors {

namespace {

template <typename T>
void Extend(Input& in, Output& out)
{
    auto v = ReadIntervalVector<T>(in);
    const auto from = in.Get<std::uint64_t>();
    const bool result = v.extend(from, in.Get<std::uint64_t>());
    out.Add(result, v);
}

template <typename T>
void ClearSection(Input& in, Output& out)
{
    auto v = ReadIntervalVector<T>(in);
    const auto from = in.Get<std::uint64_t>();
    v.clear_section(from, in.Get<std::uint64_t>());
    out.Add(v);
}

template <typename T>
void BlitFromAnother(Input& in, Output& out)
{
    auto v = ReadIntervalVector<T>(in);
    const auto other = ReadIntervalVector<T>(in);
    v.fast_blit_from_another(other, in.Get<std::int64_t>());
    out.Add(v, other);
}

template <typename T>
void SetCell(Input& in, Output& out)
{
    auto v = ReadIntervalVector<T>(in);
    const auto i = in.Get<std::uint64_t>();
    v.set(i, in.Get<T>());
    out.Add(v);
}

template <typename T>
void Copy(Input& in, Output& out)
{
    const auto source = ReadIntervalVector<T>(in);
    const auto copy = source;
    out.Add(copy, source);
}

template <typename T>
void AddFor(Table& table, const std::string& type)
{
    const std::string prefix = "interval_vector<" + type + ">::";
    table.Add(prefix + "extend", Extend<T>);
    table.Add(prefix + "clear_section", ClearSection<T>);
    table.Add(prefix + "fast_blit_from_another", BlitFromAnother<T>);
    table.Add(prefix + "set", SetCell<T>);
    table.Add(prefix + "copy", Copy<T>);
}

} // namespace

void AddIntervalVectorAdapters(Table& table)
{
    AddFor<int>(table, "int");
    AddFor<vector2dT<float, false>>(table, "vector2dT<float, false>");
}

} // namespace ZarnMath::Vectors
