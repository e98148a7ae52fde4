#include "tests/vectors/Table.h"

#include <cmath>

namespace ZarnMath::Vectors {

namespace {

/// Arguments that the compiler cannot see: a call that it folds would be its own mathematics, not the platform's.
double Opaque(double v)
{
    volatile double seen = v;
    return seen;
}

void AddUnary(Table& table, Platform function, double (*call)(double))
{
    table.Add(NameOf(function), [call](Input& in, Output& out) { out.Add(call(Opaque(in.Get<double>()))); },
              {function});
}

void AddBinary(Table& table, Platform function, double (*call)(double, double))
{
    const auto adapter = [call](Input& in, Output& out) {
        const double first = Opaque(in.Get<double>());
        const double second = Opaque(in.Get<double>());
        out.Add(call(first, second));
    };
    table.Add(NameOf(function), adapter, {function});
}

} // namespace

void AddPlatformAdapters(Table& table)
{
    AddUnary(table, Platform::Sin, std::sin);
    AddUnary(table, Platform::Cos, std::cos);
    AddUnary(table, Platform::Tan, std::tan);
    AddUnary(table, Platform::Atan, std::atan);
    AddUnary(table, Platform::Acos, std::acos);
    AddUnary(table, Platform::Exp, std::exp);
    AddUnary(table, Platform::Log, std::log);
    AddBinary(table, Platform::Atan2, std::atan2);
    AddBinary(table, Platform::Pow, std::pow);
}

} // namespace ZarnMath::Vectors
