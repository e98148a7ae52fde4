#include "benchmarks/peers/CorpusFiles.h"

#include "benchmarks/peers/Truth.h"

#include <fstream>
#include <limits>
#include <stdexcept>

namespace ZarnMath::Peers {

namespace {

/// Writes elements whose memory is nothing but doubles.
template <typename Element>
void Write(const std::filesystem::path& file, const std::vector<Element>& elements)
{
    static_assert(sizeof(Element) % sizeof(double) == 0);
    std::ofstream stream(file, std::ios::binary);
    stream.write(reinterpret_cast<const char*>(elements.data()),
                 static_cast<std::streamsize>(elements.size() * sizeof(Element)));
    if (!stream)
        throw std::runtime_error("cannot write " + file.string());
}

template <int N>
void WritePolynomials(const std::filesystem::path& folder)
{
    const auto polygons = Benchmarks::RandomPolygons<N>();
    std::vector<std::array<double, N + 1>> rows;
    for (const std::vector<double>& roots : TrueRoots<N>(polygons)) {
        auto& row = rows.emplace_back();
        row.fill(std::numeric_limits<double>::quiet_NaN());
        row[0] = static_cast<double>(roots.size());
        std::copy(roots.begin(), roots.end(), row.begin() + 1);
    }
    Write(folder / ("polynomials-" + std::to_string(N)), polygons);
    Write(folder / ("roots-" + std::to_string(N)), rows);
}

} // namespace

void WriteCorpus(const Benchmarks::Corpus& corpus, const std::filesystem::path& folder)
{
    std::filesystem::create_directories(folder);
    Write(folder / "curves", corpus.real.curves);
    Write(folder / "others", corpus.real.others);
    Write(folder / "points", corpus.real.points);
    Write(folder / "lines", corpus.real.lines);

    std::vector<double> distances;
    std::vector<double> lengths;
    std::vector<Box> boxes;
    for (std::size_t i = 0; i < corpus.real.curves.size(); ++i) {
        const Cubic& curve = corpus.real.curves[i];
        distances.push_back(TrueDistance(curve, corpus.real.points[i]));
        lengths.push_back(TrueLength(curve));
        boxes.push_back(TrueBox(curve));
    }
    Write(folder / "nearest", distances);
    Write(folder / "lengths", lengths);
    Write(folder / "boxes", boxes);
    WritePolynomials<3>(folder);
    WritePolynomials<5>(folder);
    WritePolynomials<9>(folder);
    WritePolynomials<12>(folder);
}

} // namespace ZarnMath::Peers
