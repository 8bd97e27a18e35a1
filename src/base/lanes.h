// Doubles side by side: one type for the mathematics of one row, or of two, four or eight of them.
//
// A function template over the number type V runs with V = double and with V = Lanes<N>. Each lane
// holds the bits that the double would: only + - * / and the square root are used, which round
// alike everywhere, and select() takes one of two results that are both computed.
#pragma once

#include <array>
#include <bit>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <type_traits>

#if defined(__AVX__) || defined(__SSE2__)
#include <immintrin.h>
#elif defined(__aarch64__)
#include <arm_neon.h>
#elif defined(__wasm_simd128__)
#include <wasm_simd128.h>
#endif

// Vectors wider than the registers of the processor stay within the inlined functions here.
#if defined(__GNUC__) && !defined(__clang__)
#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wpsabi"
#endif

namespace vantrel {

#ifdef __GNUC__
/// The compiler's vectors of N doubles, of their bits, and of what comparing them yields.
template <int N> struct Vector;
template <> struct Vector<2> {
    using Doubles = double __attribute__((vector_size(16)));
    using Bits = std::uint64_t __attribute__((vector_size(16)));
    using Truths = std::int64_t __attribute__((vector_size(16)));
};
template <> struct Vector<4> {
    using Doubles = double __attribute__((vector_size(32)));
    using Bits = std::uint64_t __attribute__((vector_size(32)));
    using Truths = std::int64_t __attribute__((vector_size(32)));
};
template <> struct Vector<8> {
    using Doubles = double __attribute__((vector_size(64)));
    using Bits = std::uint64_t __attribute__((vector_size(64)));
    using Truths = std::int64_t __attribute__((vector_size(64)));
};

/// In which lanes a condition holds.
template <int N> struct Mask {
    typename Vector<N>::Truths m;

    friend Mask operator&(Mask a, Mask b) { return {a.m & b.m}; }
    friend Mask operator|(Mask a, Mask b) { return {a.m | b.m}; }
    friend Mask operator^(Mask a, Mask b) { return {a.m ^ b.m}; }
    friend Mask operator!(Mask a) { return {~a.m}; }
};

/// N doubles, N = 2, 4 or 8: as many as fit a vector register.
template <int N> struct Lanes {
    using Doubles = typename Vector<N>::Doubles;

    Doubles v;

    Lanes() = default;
    Lanes(Doubles values) : v(values) {}
    Lanes(double value) : v(value - Doubles{}) {} // a zero keeps its sign

    double operator[](int i) const { return v[i]; }

    friend Lanes operator+(Lanes a, Lanes b) { return a.v + b.v; }
    friend Lanes operator-(Lanes a, Lanes b) { return a.v - b.v; }
    friend Lanes operator*(Lanes a, Lanes b) { return a.v * b.v; }
    friend Lanes operator/(Lanes a, Lanes b) { return a.v / b.v; }
    friend Lanes operator-(Lanes a) { return -a.v; }
    friend Mask<N> operator<(Lanes a, Lanes b) { return {a.v < b.v}; }
    friend Mask<N> operator<=(Lanes a, Lanes b) { return {a.v <= b.v}; }
    friend Mask<N> operator>(Lanes a, Lanes b) { return {a.v > b.v}; }
    friend Mask<N> operator>=(Lanes a, Lanes b) { return {a.v >= b.v}; }
    friend Mask<N> operator==(Lanes a, Lanes b) { return {a.v == b.v}; }
    friend Mask<N> operator!=(Lanes a, Lanes b) { return {a.v != b.v}; }
    Lanes &operator+=(Lanes b) { return *this = *this + b; }
    Lanes &operator-=(Lanes b) { return *this = *this - b; }
};

#endif

inline std::uint64_t bits(double x) { return std::bit_cast<std::uint64_t>(x); }
inline double from_bits(std::uint64_t x) { return std::bit_cast<double>(x); }
/// a where the condition holds, otherwise b.
inline double select(bool condition, double a, double b) { return condition ? a : b; }
inline bool any(bool condition) { return condition; }

/// The square root by the processor's instruction, which is IEEE's at every level of optimisation.
inline double sqrt(double x)
{
#ifdef __GNUC__
    return __builtin_sqrt(x);
#else
    return std::sqrt(x);
#endif
}

#ifdef __GNUC__
template <int N> typename Vector<N>::Bits bits(Lanes<N> x)
{
    return std::bit_cast<typename Vector<N>::Bits>(x.v);
}
template <class Bits> auto from_bits(Bits x)
{
    using Result = Lanes<sizeof(Bits) / sizeof(double)>;
    return Result(std::bit_cast<typename Result::Doubles>(x));
}

template <int N>
Lanes<N> select(Mask<N> condition, std::type_identity_t<Lanes<N>> a,
                std::type_identity_t<Lanes<N>> b)
{
    return condition.m ? a.v : b.v;
}

template <int N> bool any(Mask<N> condition)
{
#if defined(__AVX512DQ__)
    if constexpr (N == 8)
        return _mm512_movepi64_mask((__m512i)condition.m) != 0;
#endif
#if defined(__AVX__)
    if constexpr (N == 4)
        return _mm256_movemask_pd((__m256d)condition.m) != 0;
#endif
#if defined(__SSE2__)
    if constexpr (N == 2)
        return _mm_movemask_pd((__m128d)condition.m) != 0;
#endif
    for (int i = 0; i < N; ++i)
        if (condition.m[i])
            return true;
    return false;
}

template <int N> Lanes<N> sqrt(Lanes<N> x)
{
#if defined(__AVX512F__)
    if constexpr (N == 8)
        return _mm512_maskz_sqrt_pd(0xFF, x.v);
#endif
#if defined(__AVX__)
    if constexpr (N == 4)
        return _mm256_sqrt_pd(x.v);
#endif
#if defined(__SSE2__)
    if constexpr (N == 2)
        return _mm_sqrt_pd(x.v);
#elif defined(__aarch64__)
    if constexpr (N == 2)
        return vsqrtq_f64(x.v);
#elif defined(__wasm_simd128__)
    if constexpr (N == 2)
        return wasm_f64x2_sqrt(x.v);
#endif
    Lanes<N> roots;
    for (int i = 0; i < N; ++i)
        roots.v[i] = sqrt(x[i]);
    return roots;
}

#endif

inline constexpr std::uint64_t kSignBit = 0x8000000000000000;

template <class V> V abs(V x) { return from_bits(bits(x) & ~kSignBit); }
template <class V> V copysign(V size, V sign)
{
    return from_bits((bits(size) & ~kSignBit) | (bits(sign) & kSignBit));
}

/// The larger and the smaller one; a where b is not a number.
template <class V> V larger(V a, V b) { return select(a < b, b, a); }
template <class V> V smaller(V a, V b) { return select(b < a, b, a); }

// The most doubles that one call computes side by side: 4 where the processor has AVX2, or 2, or 1.
// All give the same bits, as scripts/test-bits shows.
#ifndef VANTREL_LANES
#ifdef __GNUC__
#define VANTREL_LANES 4
#else
#define VANTREL_LANES 1
#endif
#endif

/// f of two numbers at the same time.
template <class F> std::array<double, 2> side_by_side(F f, double a, double b)
{
#if VANTREL_LANES > 1
    const Lanes<2> both = f(Lanes<2>(Vector<2>::Doubles{a, b}));
    return {both[0], both[1]};
#else
    return {f(a), f(b)};
#endif
}
template <class F, class V> std::array<V, 2> side_by_side(F f, V a, V b) { return {f(a), f(b)}; }

/// f(a1, b1) and f(a2, b2) at the same time.
template <class F>
std::array<double, 2> side_by_side(F f, double a1, double a2, double b1, double b2)
{
#if VANTREL_LANES > 1
    const Lanes<2> both =
        f(Lanes<2>(Vector<2>::Doubles{a1, a2}), Lanes<2>(Vector<2>::Doubles{b1, b2}));
    return {both[0], both[1]};
#else
    return {f(a1, b1), f(a2, b2)};
#endif
}
template <class F, class V> std::array<V, 2> side_by_side(F f, V a1, V a2, V b1, V b2)
{
    return {f(a1, b1), f(a2, b2)};
}

} // namespace vantrel

#if defined(__GNUC__) && !defined(__clang__)
#pragma GCC diagnostic pop
#endif
