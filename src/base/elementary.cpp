#include "base/elementary.h"

namespace vantrel {

double log(double x) { return elementary::log(x); }
double log10(double x) { return elementary::log10(x); }
double exp(double x) { return elementary::exp(x); }
double exp10(double x) { return elementary::exp10(x); }
double near_cube_root(double x, double y) { return elementary::near_cube_root(x, y); }
double sin(double x) { return elementary::sin(x); }
double cos(double x) { return elementary::cos(x); }
double atan2(double y, double x) { return elementary::atan2(y, x); }

namespace elementary {

// 2/pi in digits of 32 bits.
static constexpr std::uint32_t kTwoOverPi[] = {
    0xa2f9836e, 0x4e441529, 0xfc2757d1, 0xf534ddc0, 0xdb629599, 0x3c439041, 0xfe5163ab, 0xdebbc561,
    0xb7246e3a, 0x424dd2e0, 0x06492eea, 0x09d1921c, 0xfe1deb1c, 0xb129a73e, 0xe88235f5, 0x2ebb4484,
    0xe99c7026, 0xb45f7e41, 0x3991d639, 0x835339f4, 0x9c845f8b, 0xbdf9283b, 0x1ff897ff, 0xde05980f,
    0xef2f118b, 0x5a0a6d1f, 0x6d367ecf, 0x27cb09b7, 0x4f463f66, 0x9e5fea2d, 0x7527bac7, 0xebe5f17b,
    0x3d0739f7, 0x8a5292ea, 0x6bfb5fb1, 0x1f8d5d08, 0x56033046, 0xfc7b6bab, 0xf0cfbc20, 0x9af4361d};

// Multiplies the mantissa with those digits of 2/pi that decide quadrant and fraction (Payne and
// Hanek, SIGNUM Newsletter 18, 1983).
Angle<double> reduce_large(double x)
{
    if (!(abs(x) <= kLargest))
        return {kNan, kNan, 0};
    // |x| = mantissa 2^(32 shift), the mantissa in three digits.
    constexpr int kBias = 1023 + 52;
    const int exponent = static_cast<int>(bits(abs(x)) >> 52) - kBias;
    const int shift = (exponent + 64) / 32 - 2;
    const int places = exponent - 32 * shift;
    const std::uint64_t mantissa = (bits(x) & kMantissa) | (kMantissa + 1);
    const std::uint64_t digits[] = {(mantissa << places) & 0xFFFFFFFF,
                                    (mantissa << places >> 32) & 0xFFFFFFFF,
                                    places ? mantissa >> (64 - places) : 0};
    // fraction[k] has the weight 2^(-32 k) quarter turns.
    constexpr int kDigits = 6;
    std::uint64_t fraction[kDigits + 1] = {};
    std::uint64_t carry = 0;
    for (int k = kDigits; k >= 0; --k) {
        std::uint64_t low = carry, high = 0;
        for (int a = 0; a < 3; ++a) {
            const int i = a + shift - 1 + k;
            const std::uint64_t product = i >= 0 ? digits[a] * kTwoOverPi[i] : 0;
            low += product & 0xFFFFFFFF;
            high += product >> 32;
        }
        fraction[k] = low & 0xFFFFFFFF;
        carry = high + (low >> 32);
    }
    // To the nearest quarter turn, the rest from -1/2 to 1/2 in two doubles.
    std::uint64_t quadrant = fraction[0];
    double high = 0, low = 0, weight = 0x1p-192;
    for (int k = kDigits; k >= 1; --k) {
        double digit = static_cast<double>(fraction[k]);
        if (k == 1 && fraction[1] >= 0x80000000) {
            digit -= 0x1p32;
            ++quadrant;
        }
        const double sum = digit * weight + high;
        const double added = sum - high;
        low += (high - (sum - added)) + (digit * weight - added);
        high = sum;
        weight *= 0x1p32;
    }
    const double product = high * kHalfPi.high;
    const double rest =
        product_error(high, kHalfPi.high, product) + high * kHalfPi.low + low * kHalfPi.high;
    const double r = product + rest;
    const double dropped = (product - r) + rest;
    return x < 0 ? Angle<double>{-r, -dropped, 0 - quadrant} : Angle<double>{r, dropped, quadrant};
}

} // namespace elementary
} // namespace vantrel
