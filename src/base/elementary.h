// Elementary functions in + - * / and the square root.
//
// The mathematics library of every system rounds its last places in its own way. What is computed
// here is the same 64 bits on every processor, from every compiler, for one double or for several
// side by side. A result is at most 0.75 units in the last place (ulp) off, 1 where it is
// subnormal: the limits that the test holds. The largest errors that scripts/test-elementary has
// seen beside MPFR stand with each function. A result that is a double is exact, of 10^x up to
// 10^22; special values are those of C.
#pragma once

#include "base/lanes.h"

#include <limits>

namespace vantrel {

/// Natural and decimal logarithm of any double; 0.73 and 0.69 ulp.
double log(double x);
double log10(double x);

/// e^x and 10^x of any double; 0.67 ulp.
double exp(double x);
double exp10(double x);

/// x^y for an exponent y within 4e-9 of 1/3; 0.67 ulp where y has ten
/// decimals, 0.74 where it has eight.
double near_cube_root(double x, double y);

/// Sine and cosine of any angle in radians; 0.73 ulp.
double sin(double x);
double cos(double x);

/// The angle of the point (x, y) in radians, from -pi to pi; 0.55 ulp.
double atan2(double y, double x);

namespace elementary {

inline constexpr double kInfinity = std::numeric_limits<double>::infinity();
inline constexpr double kNan = std::numeric_limits<double>::quiet_NaN();
inline constexpr double kLeastNormal = 0x1p-1022;
inline constexpr double kLargest = 0x1.fffffffffffffp1023;

inline constexpr std::uint64_t kMantissa = 0x000FFFFFFFFFFFFF;
inline constexpr std::uint64_t kOne = 0x3FF0000000000000; ///< the bits of 1

/// The constant of a reduction in two parts: products of the high one with small integers, or with
/// another high part, are exact.
struct Parts {
    double high, low;
};
inline constexpr Parts kLn2 = {0x1.62e42fefap-1, 0x1.cf79abc9e3b3ap-40};
inline constexpr Parts kLog10Of2 = {0x1.34413509fp-2, 0x1.e7fbcc47c4acdp-40};
inline constexpr Parts kLog10OfE = {0x1.bcb7b1p-2, 0x1.49b9438ca9aaep-28};
inline constexpr Parts kLn10 = {0x1.26bb1b8p+1, 0x1.daaa8ac16ea57p-26};

/// Constants to twice the precision of a double.
inline constexpr Parts kPi = {0x1.921fb54442d18p+1, 0x1.1a62633145c07p-53};
inline constexpr Parts kHalfPi = {0x1.921fb54442d18p+0, 0x1.1a62633145c07p-54};
inline constexpr Parts kQuarterPi = {0x1.921fb54442d18p-1, 0x1.1a62633145c07p-55};
inline constexpr Parts kArctanOfHalf = {0x1.dac670561bb4fp-2, 0x1.a2b7f222f65e2p-56};

/// x without its last bits: 26 of them are left, or fewer.
inline constexpr std::uint64_t kLeading26 = ~((std::uint64_t{1} << 27) - 1);
inline constexpr std::uint64_t kLeading23 = ~((std::uint64_t{1} << 30) - 1);
inline constexpr std::uint64_t kLeading21 = ~((std::uint64_t{1} << 32) - 1);
template <class V> V leading(V x, std::uint64_t kept = kLeading26)
{
    return from_bits(bits(x) & kept);
}

/// What the product p = fl(a b) leaves out (Dekker 1971).
template <class V> V product_error(V a, V b, V p)
{
    const V a1 = leading(a), b1 = leading(b);
    const V a2 = a - a1, b2 = b - b1;
    return ((a1 * b1 - p) + a1 * b2 + a2 * b1) + a2 * b2;
}

/// c[0] + c[1] x + c[2] x^2 + …, two chains of Horner's that run at the same time.
template <class V, std::size_t n> V polynomial(V x, const double (&c)[n])
{
    const V xx = x * x;
    V odd = c[n - 1], even = c[n - 2];
    for (std::size_t i = n - 2; i >= 2; i -= 2) {
        odd = odd * xx + c[i - 1];
        even = even * xx + c[i - 2];
    }
    const V sum = even + x * odd;
    return n % 2 ? c[0] + x * sum : sum;
}

/// To the nearest integer, below 2^51. The last bits of the sum are those of the integer.
inline constexpr double kRounder = 0x1.8p52;
template <class V> V to_integer(V x) { return (x + kRounder) - kRounder; }

/// 2^k for an integer k of -1022 to 1023.
template <class V> V power_of_2(V k) { return from_bits(bits(k + (kRounder + 1023)) << 52); }

/// The integer that stands in the last bits.
template <class B> auto small_integer(B b) { return from_bits(b | bits(0x1p52)) - 0x1p52; }

template <class V> auto is_normal(V x) { return (x >= kLeastNormal) & (x <= kLargest); }

// Logarithms: x = 2^k m with m from √½ to √2, s = (m - 1) / (m + 1), and
// log m = f - f²/2 + s (f²/2 + R(s²)) with f = m - 1 (Ng, fdlibm 1993).

/// k and log m; the high part has 32 trailing zeros.
template <class V> struct Logarithm {
    V k, high, low;
};

template <class V> Logarithm<V> log_parts(V x)
{
    static constexpr double kR[] = {
        0x1.5555555555558p-1, 0x1.99999999952d1p-2, 0x1.2492492df8654p-2, 0x1.c71c62dab0ee1p-3,
        0x1.7462b7d8ce7cfp-3, 0x1.39fdf803dc2d9p-3, 0x1.2b5d2f498c80ap-3};
    constexpr std::uint64_t kRootOfHalf = 0x3FE6A09E667F3BCD;
    const auto b = bits(x) + (kOne - kRootOfHalf);
    const V k = small_integer(b >> 52) - 1023;
    const V f = from_bits((b & kMantissa) + kRootOfHalf) - 1;
    const V s = f / (2 + f);
    const V z = s * s;
    const V half_square = 0.5 * f * f;
    const V high = leading(f - half_square, kLeading21);
    return {k, high, (f - high) - half_square + s * (half_square + z * polynomial(z, kR))};
}

/// f(Logarithm of x) for normal numbers, and what C says for the others.
template <class V, class F> V logarithm(V x, F f)
{
    if (!any(!is_normal(x))) [[likely]]
        return f(log_parts(x));
    const auto subnormal = x < kLeastNormal;
    Logarithm<V> parts = log_parts(select(subnormal, x * 0x1p54, x));
    parts.k -= select(subnormal, V(54), V(0));
    return select(x > 0, select(x == kInfinity, x, f(parts)),
                  select(x == 0, V(-kInfinity), V(kNan)));
}

template <class V> V log(V x)
{
    return logarithm(x, [](const Logarithm<V> &m) {
        const V scale = m.k * kLn2.high;
        const V sum = scale + m.high;
        return sum + (((scale - sum) + m.high) + (m.k * kLn2.low + m.low));
    });
}

template <class V> V log10(V x)
{
    return logarithm(x, [](const Logarithm<V> &m) {
        const V scale = m.k * kLog10Of2.high;
        const V product = m.high * kLog10OfE.high;
        const V sum = scale + product;
        const V rest =
            m.k * kLog10Of2.low + (m.low + m.high) * kLog10OfE.low + m.low * kLog10OfE.high;
        return sum + (((scale - sum) + product) + rest);
    });
}

// Powers: x = k ln 2 + r, and e^x = 2^k (1 + r + r² Q(r)).

/// 2^k e^(high + low), |high + low| up to (ln 2) / 2.
template <class V> V exp_of_parts(V k, V high, V low)
{
    static constexpr double kQ[] = {0x1p-1,
                                    0x1.5555555555557p-3,
                                    0x1.5555555555557p-5,
                                    0x1.111111111005p-7,
                                    0x1.6c16c16c156a4p-10,
                                    0x1.a01a01ac1e94fp-13,
                                    0x1.a01a01ab9934p-16,
                                    0x1.71de01aab7265p-19,
                                    0x1.27e4cfacb408p-22,
                                    0x1.af4ecf71c6de7p-26,
                                    0x1.1f86f5b271923p-29};
    const V r = high + low;
    const V sum = 1 + high;
    const V power = sum + (((1 - sum) + high) + (low + r * r * polynomial(r, kQ)));
    const V half = to_integer(0.5 * k); // in two steps, since 2^k may not be a normal number
    return power * power_of_2(half) * power_of_2(k - half);
}

template <class V> V exp(V x)
{
    const V y = smaller(larger(x, V(-746)), V(710));
    const V k = to_integer(y * 0x1.71547652b82fep+0);
    return exp_of_parts(k, y - k * kLn2.high, -(k * kLn2.low));
}

template <class V> V exp10(V x)
{
    const V y = smaller(larger(x, V(-324)), V(309));
    const V k = to_integer(y * 0x1.a934f0979a371p+1);
    const V r = y - k * kLog10Of2.high;
    const V r1 = leading(r);
    return exp_of_parts(k, r1 * kLn10.high,
                        (r - r1) * kLn10.high + r * kLn10.low -
                            k * (kLog10Of2.low * (kLn10.high + kLn10.low)));
}

// x^y = ∛x x^-d, d = 1/3 - y: the cube root by a step of Halley's from 23 bits on, and
// x^-d = 1 - u + u²/2, u = d ln x, for which ten decimals of the logarithm are enough.

/// log m by the powers of m, 1 to 2. Not in the function: the linker would join the tables of all
/// builds of a template, those for newer processors included.
constexpr double kLogOfMantissa[] = {
    -0x1.6092a32a5d6f8p+1, 0x1.0e41ccb84bf2bp+3, -0x1.043649a39a1e8p+4, 0x1.92e00fe637ae3p+4,
    -0x1.d749e7447706ap+4, 0x1.a019d0bd0bd94p+4, -0x1.15a85635777b5p+4, 0x1.16a555164bafbp+3,
    -0x1.9e4656945f234p+1, 0x1.bacc152858136p-1, -0x1.41eb8c6d4ccdcp-3, 0x1.1d34671d337dap-6,
    -0x1.d0efae7c714b6p-11};

/// For a normal x, which stands for x 2^-down.
template <class V> V root_of_normal(V x, double y, V down)
{
    static constexpr double kRoot[] = {
        0x1.b42648613923ap-2,  0x1.0e47e0f53ce4fp+0, -0x1.c77345675bc91p-1, 0x1.4a3f9857830ap-1,
        -0x1.4b882010c8d23p-2, 0x1.abd8ea5835697p-4, -0x1.3ed90ff5478ecp-6, 0x1.a106089abdd43p-10};
    const double d = ((1 - 2 * y) - y) / 3;          // both differences are exact
    const V exponent = small_integer(bits(x) >> 52); // and 1023
    // floor(exponent / 3), exact in every rounding mode: 21846 / 2^16 is a little above 1/3.
    const V third = small_integer((bits(exponent * 21846 + 0x1p52) & kMantissa) >> 16);
    const V rest = exponent - 3 * third;
    const V m = from_bits((bits(x) & kMantissa) | kOne);
    // The parabola through 1, ∛2 and ∛4.
    const V root_of_rest = 1 + rest * (0x1.cf23503e16fbcp-3 + 0x1.14b8b2228926cp-5 * rest);
    const V t = leading(polynomial(m, kRoot) * root_of_rest, kLeading23);
    const V quotient = m * power_of_2(rest) / (t * t);
    const V step = (quotient - t) / (t + t + quotient);
    const V u = d * ((exponent - (1023 + down)) * kLn2.high + polynomial(m, kLogOfMantissa));
    const V power = u * (0.5 * u - 1);
    return (t + t * (step + power + step * power)) * power_of_2(third - (341 + down / 3));
}

template <class V> V near_cube_root(V x, double y)
{
    if (any(!is_normal(x))) [[unlikely]] {
        const auto subnormal = (x > 0) & (x < kLeastNormal);
        const V root =
            root_of_normal(select(subnormal, x * 0x1p54, x), y, select(subnormal, V(54), V(0)));
        return select(is_normal(x) | subnormal, root,
                      select((x == 0) | (abs(x) == kInfinity), abs(x), V(kNan)));
    }
    return root_of_normal(x, y, V(0));
}

// Angles: x = k pi/2 + r, r in two doubles, and the sine and the cosine of r (Ng, fdlibm 1993).

/// r, and k in the last bits of `quadrant`.
template <class V> struct Angle {
    V high, low;
    decltype(bits(V())) quadrant;
};

/// From here on pi/2 is needed to more than 119 bits.
inline constexpr double kLargeAngle = 800000;

/// The reduction of one angle of any size.
Angle<double> reduce_large(double x);

inline void reduce_large(double x, Angle<double> &angle) { angle = reduce_large(x); }
#ifdef __GNUC__
template <int N> void reduce_large(Lanes<N> x, Angle<Lanes<N>> &angle)
{
    for (int i = 0; i < N; ++i) {
        if (abs(x[i]) < kLargeAngle)
            continue;
        const Angle<double> reduced = reduce_large(x[i]);
        angle.high.v[i] = reduced.high;
        angle.low.v[i] = reduced.low;
        angle.quadrant[i] = reduced.quadrant;
    }
}

#endif

template <class V> Angle<V> reduce(V x)
{
    constexpr double kP1 = 0x1.921fb544p+0, kP2 = 0x1.0b4611a6p-34, kP3 = 0x1.3198a2e037073p-69;
    const V turns = x * 0x1.45f306dc9c883p-1 + kRounder;
    const V k = turns - kRounder;
    const V r = x - k * kP1;
    const V p = k * kP2;
    const V high = r - p;
    const V added = high - r;
    const V low = k * kP3 - ((r - (high - added)) - (p + added));
    const V sum = high - low;
    Angle<V> angle = {sum, (high - sum) - low, bits(turns)};
    if (any(!(abs(x) < kLargeAngle))) [[unlikely]]
        reduce_large(x, angle);
    return angle;
}

/// The sine of an angle and some quarter turns.
template <class V> V sin_of_parts(const Angle<V> &angle, std::uint64_t quarters)
{
    constexpr double kS1 = -0x1.5555555555555p-3;
    static constexpr double kS[] = {0x1.1111111110c83p-7, -0x1.a01a019ea13ecp-13,
                                    0x1.71de37b1e8b31p-19, -0x1.ae60212abadc3p-26,
                                    0x1.5e119f5dfc212p-33};
    static constexpr double kC[] = {0x1.5555555555555p-5,  -0x1.6c16c16c168ccp-10,
                                    0x1.a01a019f38b5fp-16, -0x1.27e4fa037adedp-22,
                                    0x1.1eeb5862b8c23p-29, -0x1.9073e351a3d9ap-37};
    const V r = angle.high, rest = angle.low;
    const V z = r * r;
    const V cube = z * r;
    const V z_error = product_error(r, r, z);
    const V sine = r - ((z * (0.5 * rest - cube * polynomial(z, kS)) - (rest + z_error * r * kS1)) -
                        cube * kS1);
    const V half = 0.5 * z;
    const V most = 1 - half;
    const V dropped = r * rest + 0.5 * z_error;
    const V cosine = most + (((1 - most) - half) + (z * z * polynomial(z, kC) - dropped));
    const auto quadrant = angle.quadrant + quarters;
    const auto odd = -(quadrant & 1);
    return from_bits(((bits(cosine) & odd) | (bits(sine) & ~odd)) ^ ((quadrant & 2) << 62));
}

template <class V> V sin(V x) { return sin_of_parts(reduce(x), 0); }
template <class V> V cos(V x) { return sin_of_parts(reduce(x), 1); }

/// arctan(n / d) for 0 <= n <= d in ordinary range, counted onward from the x axis, or backward
/// from the y axis (`steep`), or either mirrored to the left.
///
/// With c = 0, 1/2 or 1 near n / d, arctan(n / d) = arctan c + arctan((n - c d) / (d + c n)).
template <class V, class M> V arctan_of_ratio(V n, V d, M steep, M left)
{
    static constexpr double kA[] = {
        -0x1.5555555555555p-2, 0x1.999999999968ep-3,  -0x1.2492492454a8bp-3,
        0x1.c71c7182998a2p-4,  -0x1.745d0312358bcp-4, 0x1.3b103cd7e15edp-4,
        -0x1.10b639bdd0973p-4, 0x1.d6c59d98b03p-5,    -0x1.4e37102c15d97p-5};
    const auto middle = n > 0.25 * d, high = n > 0.6875 * d;
    const V c = select(high, V(1), select(middle, V(0.5), V(0)));
    const V numerator = n - c * d; // exact
    const V denominator = d + c * n;
    const V dropped = (d - denominator) + c * n;
    const V inverse = 1 / denominator;
    const V q = numerator * inverse;
    const V p = q * denominator;
    const V remainder = (numerator - p) - product_error(q, denominator, p) - q * dropped;
    const V z = q * q;
    const V rest = remainder * inverse * (1 - z) + q * z * polynomial(z, kA);

    V base = select(high, V(kQuarterPi.high), select(middle, V(kArctanOfHalf.high), V(0)));
    V base_low = select(high, V(kQuarterPi.low), select(middle, V(kArctanOfHalf.low), V(0)));
    const auto subtract_from = [&](const Parts &whole, M where) {
        const V difference = whole.high - base;
        const V low = ((whole.high - difference) - base) + (whole.low - base_low);
        base = select(where, difference, base);
        base_low = select(where, low, base_low);
    };
    subtract_from(kHalfPi, steep);
    subtract_from(kPi, left);
    const V sign = select(steep ^ left, V(-1), V(1));
    const V sum = base + sign * q;
    return sum + (((base - sum) + sign * q) + (base_low + sign * rest));
}

template <class V> V atan2(V y, V x)
{
    constexpr double kHigh = 0x1p400, kLow = 0x1p-400, kSmallAngle = 0x1p-60;
    const V a = abs(y), b = abs(x);
    const auto steep = b < a;
    const auto left = copysign(V(1), x) < 0;
    V n = select(steep, b, a), d = select(steep, a, b);
    const auto ordinary = (d >= kLow) & (d <= kHigh) & ((n >= kLow) | (n == 0));
    if (!any(!ordinary)) [[likely]]
        return copysign(arctan_of_ratio(n, d, steep, left), y);

    const auto infinite = d == kInfinity;
    n = select(infinite, select(n == kInfinity, V(1), V(0)), n);
    d = select(infinite | (d == 0), V(1), d);
    const V ratio = n / d;
    const auto small = (!ordinary) & (ratio < kSmallAngle); // its own arc tangent
    const V scale = select(d > kHigh, V(0x1p-624), select(d < kLow, V(0x1p600), V(1)));
    const V arctan = arctan_of_ratio(select(small, V(0), n * scale), d * scale, steep, left);
    const V angle = copysign(select(small & !(steep | left), ratio, arctan), y);
    return select(abs(x) >= 0, select(abs(y) >= 0, angle, y), x); // not-a-numbers stay
}

} // namespace elementary

#ifdef __GNUC__
template <int N> Lanes<N> log(Lanes<N> x) { return elementary::log(x); }
template <int N> Lanes<N> log10(Lanes<N> x) { return elementary::log10(x); }
template <int N> Lanes<N> exp(Lanes<N> x) { return elementary::exp(x); }
template <int N> Lanes<N> exp10(Lanes<N> x) { return elementary::exp10(x); }
template <int N> Lanes<N> near_cube_root(Lanes<N> x, double y)
{
    return elementary::near_cube_root(x, y);
}
template <int N> Lanes<N> sin(Lanes<N> x) { return elementary::sin(x); }
template <int N> Lanes<N> cos(Lanes<N> x) { return elementary::cos(x); }
template <int N> Lanes<N> atan2(Lanes<N> y, Lanes<N> x) { return elementary::atan2(y, x); }
#endif

} // namespace vantrel
