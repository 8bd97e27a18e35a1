// Rows of arrays side by side: a batch is as many rows as a vector register has doubles, one a
// lane. Each width has an object file of its own (VANTREL_ROWS), compiled for the processors that
// have such registers. So that none of its functions is taken for another processor's, nothing here
// is shared between object files, and nothing is computed but in lanes.
#pragma once

#include "lanes.h"

#include "base/elementary.h"
#include "base/spectrum.h"

#include <cstring>
#include <utility>

namespace {

constexpr int N = VANTREL_ROWS;
using V = vantrel::Lanes<N>;
using Bands = vantrel::BandsOf<V>;
using Lab = vantrel::LabOf<V>;
using Xyz = vantrel::XyzOf<V>;
using vantrel::kBands;

/// The first row of a batch and the last one of the array; a batch that reaches beyond it repeats
/// it.
struct Batch {
    npy_intp first, last;

    npy_intp row(int lane) const { return first + lane < last ? first + lane : last; }
    int rows() const { return last - first < N - 1 ? static_cast<int>(last - first) + 1 : N; }
};

template <class F> void each_batch(npy_intp rows, F f)
{
    for (npy_intp first = 0; first < rows; first += N)
        f(Batch{first, rows - 1});
}

/// The same in two steps: first() of a few batches, then then() of each with its result. While one
/// batch waits for its sum or its logarithm, the processor goes on with the others.
template <class First, class Then> void each_batch(npy_intp rows, First first, Then then)
{
    constexpr int kTogether = 4;
    for (npy_intp at = 0; at < rows; at += kTogether * N) {
        decltype(first(Batch{})) results[kTogether];
        for (int i = 0; i < kTogether; ++i)
            results[i] = first(Batch{at + i * N, rows - 1});
        for (int i = 0; i < kTogether; ++i)
            then(Batch{at + i * N, rows - 1}, results[i]);
    }
}

/// Whether sums over all bands are finite, and so each band is: a not-a-number or an infinity in
/// one of them stays in its sum, whatever its weight.
class Finite {
public:
    void operator()(V sum) { zeros += sum - sum; }
    Done done() const { return any(zeros != 0) ? Done::rows : Done::finite_rows; }

private:
    V zeros = 0;
};

bool is_spectrum(const Operand &o)
{
    return o.counts[0] == kBands && o.counts[1] == 1 && o.strides[0] == sizeof(double);
}
bool is_same(const Operand &o) { return o.step == 0; }

double number(const Operand &o) { return *reinterpret_cast<const double *>(o.row); }
npy_int64 integer(const Operand &o) { return *reinterpret_cast<const npy_int64 *>(o.row); }
vantrel::Spectrum spectrum(const Operand &o)
{
    return vantrel::spectrum(reinterpret_cast<const double *>(o.row));
}

V loaded(const char *at)
{
    V v;
    std::memcpy(&v, at, sizeof v);
    return v;
}

/// f(0), f(1), … f(n - 1) with constants, so that what they index stays in registers.
template <int n, class F> void unrolled(F f)
{
    [&]<int... i>(std::integer_sequence<int, i...>) { (f(std::integral_constant<int, i>()), ...); }
    (std::make_integer_sequence<int, n>());
}

/// Lane i of row j becomes lane j of row i: neighbours change places, then pairs, then quads.
template <int apart, int... first, int... second>
void change_places(V (&rows)[N], std::integer_sequence<int, first...>,
                   std::integer_sequence<int, second...>)
{
    unrolled<N>([&](auto i) {
        if constexpr ((i & apart) == 0) {
            const auto a = rows[i].v, b = rows[i + apart].v;
            rows[i] = V::Doubles(__builtin_shufflevector(a, b, first...));
            rows[i + apart] = V::Doubles(__builtin_shufflevector(a, b, second...));
        }
    });
}
template <int... i> using Order = std::integer_sequence<int, i...>;

void transpose(V (&rows)[N])
{
#if VANTREL_ROWS == 2
    change_places<1>(rows, Order<0, 2>(), Order<1, 3>());
#elif VANTREL_ROWS == 4
    change_places<1>(rows, Order<0, 4, 2, 6>(), Order<1, 5, 3, 7>());
    change_places<2>(rows, Order<0, 1, 4, 5>(), Order<2, 3, 6, 7>());
#else
    change_places<1>(rows, Order<0, 8, 2, 10, 4, 12, 6, 14>(), Order<1, 9, 3, 11, 5, 13, 7, 15>());
    change_places<2>(rows, Order<0, 1, 8, 9, 4, 5, 12, 13>(), Order<2, 3, 10, 11, 6, 7, 14, 15>());
    change_places<4>(rows, Order<0, 1, 2, 3, 8, 9, 10, 11>(), Order<4, 5, 6, 7, 12, 13, 14, 15>());
#endif
}

/// The first bands of the blocks that make up a spectrum; the last one overlaps the one before.
constexpr int block(int b) { return b * N < kBands - N ? b * N : kBands - N; }
constexpr int kBlocks = (kBands + N - 1) / N;

Bands spectra(const Operand &o, const Batch &batch)
{
    Bands bands;
    if (is_same(o)) {
        for (int i = 0; i < kBands; ++i)
            bands[i] = V(spectrum(o)[i]);
        return bands;
    }
    constexpr npy_intp kAhead = 64, kLine = 64; // rows, bytes that come from memory together
    const char *at[N];
    for (int lane = 0; lane < N; ++lane) {
        at[lane] = o.row + batch.row(lane) * o.step;
        for (npy_intp line = 0; line < npy_intp(sizeof(vantrel::Bands)); line += kLine)
            __builtin_prefetch(at[lane] + kAhead * o.step + line);
    }
    unrolled<kBlocks>([&](auto b) {
        V rows[N];
        unrolled<N>([&](auto i) { rows[i] = loaded(at[i] + block(b) * sizeof(double)); });
        transpose(rows);
        unrolled<N>([&](auto i) { bands[block(b) + i] = rows[i]; });
    });
    return bands;
}

void store(const Operand &o, const Batch &batch, const Bands &bands)
{
    unrolled<kBlocks>([&](auto b) {
        V rows[N];
        unrolled<N>([&](auto i) { rows[i] = bands[block(b) + i]; });
        transpose(rows);
        unrolled<N>([&](auto i) {
            if (i < batch.rows())
                std::memcpy(o.row + batch.row(i) * o.step + block(b) * sizeof(double), &rows[i],
                            sizeof(V));
        });
    });
}

/// One value of each row, of a core of one or more.
V values(const Operand &o, const Batch &batch, int index = 0)
{
    V v;
    for (int lane = 0; lane < N; ++lane)
        v.v[lane] = *reinterpret_cast<const double *>(o.row + batch.row(lane) * o.step +
                                                      index * o.strides[0]);
    return v;
}
template <class Element = double>
void store(const Operand &o, const Batch &batch, V v, int index = 0)
{
    double lanes[N];
    std::memcpy(lanes, &v, sizeof v);
    char *at = o.row + batch.first * o.step + index * o.strides[0];
    for (int lane = 0; lane < batch.rows(); ++lane, at += o.step)
        *reinterpret_cast<Element *>(at) = static_cast<Element>(lanes[lane]);
}

Lab labs(const Operand &o, const Batch &batch)
{
    return {values(o, batch, 0), values(o, batch, 1), values(o, batch, 2)};
}

void store(const Operand &o, const Batch &batch, V first, V second, V third)
{
    double values[3][N];
    std::memcpy(values[0], &first, sizeof first);
    std::memcpy(values[1], &second, sizeof second);
    std::memcpy(values[2], &third, sizeof third);
    char *at = o.row + batch.first * o.step;
    for (int lane = 0; lane < batch.rows(); ++lane, at += o.step)
        for (int i = 0; i < 3; ++i)
            *reinterpret_cast<double *>(at + i * o.strides[0]) = values[i][lane];
}

} // namespace
