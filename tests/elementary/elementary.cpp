// The elementary functions beside MPFR: the largest error over drawn arguments, and exact results.
//
//     elementary COUNT [SEED]
//
// draws COUNT arguments for each function, over its whole domain, where it is used and where it is
// awkward, and prints the largest error in units in the last place. It fails where one is above its
// limit, where a result that is a double or a special value of C is missed by a bit, and where two,
// four or eight doubles side by side have other bits than one.
#include "base/elementary.h"

#include <mpfr.h>

#include <array>
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <functional>
#include <random>
#include <string>
#include <utility>
#include <vector>

namespace {

using vantrel::Lanes;

/// The exponents near a third that the library takes.
constexpr double kThirds[] = {0.333333333333, 0.3333333333, 0.33333333};

using Point = std::array<double, 2>;
using Exact = void (*)(mpfr_t, mpfr_t, mpfr_t);

template <int (*f)(mpfr_t, mpfr_srcptr, mpfr_rnd_t)> void one(mpfr_t y, mpfr_t x, mpfr_t)
{
    f(y, x, MPFR_RNDN);
}

template <int i> void near_third(mpfr_t z, mpfr_t x, mpfr_t y)
{
    mpfr_set_d(y, kThirds[i], MPFR_RNDN);
    mpfr_pow(z, x, y, MPFR_RNDN);
}

/// One function as a double and as lanes of each width; the second argument may be unused.
struct Function {
    const char *name;
    double limit;
    Exact exact;
    double (*scalar)(double, double);
    Lanes<2> (*two)(Lanes<2>, Lanes<2>);
    Lanes<4> (*four)(Lanes<4>, Lanes<4>);
    Lanes<8> (*eight)(Lanes<8>, Lanes<8>);
    std::vector<std::function<Point(std::mt19937_64 &)>> draws;
};

#define ALL_WIDTHS(expression)                                                                     \
    [](double x, double y) { return (void)y, vantrel::expression; },                               \
        [](Lanes<2> x, Lanes<2> y) { return (void)y, vantrel::expression; },                       \
        [](Lanes<4> x, Lanes<4> y) { return (void)y, vantrel::expression; },                       \
        [](Lanes<8> x, Lanes<8> y) { return (void)y, vantrel::expression; }

auto uniform(double low, double high)
{
    return [=](std::mt19937_64 &random) {
        std::uniform_real_distribution<double> value(low, high);
        return Point{value(random), value(random)};
    };
}

/// Any finite double between two powers of 2, of either sign.
auto any_size(int low, int high)
{
    return [=](std::mt19937_64 &random) {
        std::uniform_real_distribution<double> mantissa(-2, 2);
        std::uniform_int_distribution<int> exponent(low, high);
        const double x = mantissa(random), y = mantissa(random);
        const int e = exponent(random);
        return Point{std::ldexp(x, e), std::ldexp(y, exponent(random))};
    };
}
auto positive(int low, int high)
{
    return [draw = any_size(low, high)](std::mt19937_64 &random) {
        const auto [x, y] = draw(random);
        return Point{std::fabs(x), y};
    };
}

/// Within a few thousand last places of multiples of a step.
auto near_multiples(double step, int most)
{
    return [=](std::mt19937_64 &random) {
        std::uniform_int_distribution<int> multiple(-most, most), places(-2000, 2000);
        const auto draw = [&] {
            const double x = step * multiple(random);
            return x + 0x1p-53 * x * places(random);
        };
        const double x = draw();
        return Point{x, draw()};
    };
}

std::vector<Function> functions()
{
    const double half_pi = std::acos(0.0);
    return {
        {"log",
         0.75,
         one<mpfr_log>,
         ALL_WIDTHS(log(x)),
         {uniform(0.5, 2), uniform(0.9, 1.1), positive(-8, 8), positive(-1074, 1023)}},
        {"log10",
         0.75,
         one<mpfr_log10>,
         ALL_WIDTHS(log10(x)),
         {uniform(0.5, 2), uniform(0.9, 1.1), positive(-8, 8), positive(-1074, 1023)}},
        {"exp",
         0.75,
         one<mpfr_exp>,
         ALL_WIDTHS(exp(x)),
         {uniform(-1, 1), uniform(-50, 50), uniform(-746, 710), near_multiples(0.5, 1400)}},
        {"exp10",
         0.75,
         one<mpfr_exp10>,
         ALL_WIDTHS(exp10(x)),
         {uniform(-1, 1), uniform(-5, 5), uniform(-324, 309), near_multiples(0.25, 1200)}},
        {"near_cube_root",
         0.75,
         near_third<0>,
         ALL_WIDTHS(near_cube_root(x, kThirds[0])),
         {uniform(0, 100), positive(-1074, 1023)}},
        {"near_cube_root (10 decimals)",
         0.75,
         near_third<1>,
         ALL_WIDTHS(near_cube_root(x, kThirds[1])),
         {uniform(0, 2), positive(-1074, 1023)}},
        {"near_cube_root (8 decimals)",
         0.75,
         near_third<2>,
         ALL_WIDTHS(near_cube_root(x, kThirds[2])),
         {uniform(0.5, 4), positive(-1074, 1023)}},
        {"sin",
         0.75,
         one<mpfr_sin>,
         ALL_WIDTHS(sin(x)),
         {uniform(-1, 1), uniform(-13, 13), uniform(-8e5, 8e5), near_multiples(half_pi, 500000),
          any_size(-1074, 1023)}},
        {"cos",
         0.75,
         one<mpfr_cos>,
         ALL_WIDTHS(cos(x)),
         {uniform(-1, 1), uniform(-13, 13), uniform(-8e5, 8e5), near_multiples(half_pi, 500000),
          any_size(-1074, 1023)}},
        {"atan2",
         0.75,
         [](mpfr_t z, mpfr_t x, mpfr_t y) { mpfr_atan2(z, x, y, MPFR_RNDN); },
         ALL_WIDTHS(atan2(x, y)),
         {uniform(-1, 1), uniform(-128, 128), near_multiples(1.0 / 16, 64), any_size(-8, 8),
          any_size(-1074, 1023)}},
    };
}

/// MPFR's result of more digits, and as a double.
class Reference {
public:
    Reference()
    {
        for (auto *number : {x, y})
            mpfr_init2(number, 53);
        mpfr_init2(z, 96);
    }
    ~Reference()
    {
        for (auto *number : {x, y, z})
            mpfr_clear(number);
    }

    double operator()(Exact exact, const Point &point)
    {
        mpfr_set_d(x, point[0], MPFR_RNDN);
        mpfr_set_d(y, point[1], MPFR_RNDN);
        exact(z, x, y);
        return mpfr_get_d(z, MPFR_RNDN);
    }

    /// Whether the last result is a double.
    bool is_exact(double result) { return mpfr_cmp_d(z, result) == 0; }

    /// Of the last result, in units in the last place.
    double error(double value, double nearest)
    {
        if (std::isnan(nearest) || std::isnan(value))
            return std::isnan(nearest) && std::isnan(value) ? 0 : INFINITY;
        if (value == nearest && (std::isinf(value) || value == 0))
            return std::signbit(value) == std::signbit(nearest) ? 0 : INFINITY;
        const double size = std::fmin(std::fmax(std::fabs(nearest), 0x1p-1022), 0x1p1023);
        mpfr_sub_d(z, z, value, MPFR_RNDN);
        mpfr_mul_2si(z, z, 52 - std::ilogb(size), MPFR_RNDN);
        return std::fabs(mpfr_get_d(z, MPFR_RNDN));
    }

private:
    mpfr_t x, y, z;
};

bool same_bits(double a, double b)
{
    return std::memcmp(&a, &b, sizeof a) == 0 || (std::isnan(a) && std::isnan(b));
}

bool good = true;

void fault(const char *name, const Point &at, const char *what)
{
    std::printf("%s(%.17g, %.17g): %s\n", name, at[0], at[1], what);
    good = false;
}

template <int N>
void compare_lanes(const Function &function, Lanes<N> (*lanes)(Lanes<N>, Lanes<N>),
                   const std::array<Point, 8> &points, const std::array<double, 8> &results)
{
    for (int first = 0; first < 8; first += N) {
        Lanes<N> x(0.0), y(0.0);
        for (int i = 0; i < N; ++i) {
            x.v[i] = points[first + i][0];
            y.v[i] = points[first + i][1];
        }
        const Lanes<N> result = lanes(x, y);
        for (int i = 0; i < N; ++i)
            if (!same_bits(result[i], results[first + i]))
                fault(function.name, points[first + i], "other bits side by side");
    }
}

void compare_lanes(const Function &function, const std::array<Point, 8> &points,
                   const std::array<double, 8> &results)
{
    compare_lanes(function, function.two, points, results);
    compare_lanes(function, function.four, points, results);
    compare_lanes(function, function.eight, points, results);
}

void measure(const Function &function, long count, std::uint64_t seed)
{
    std::mt19937_64 random(seed);
    Reference reference;
    double largest = 0;
    Point where{};
    for (long i = 0; i < count; i += 8) {
        std::array<Point, 8> points;
        std::array<double, 8> results;
        for (std::size_t k = 0; k < 8; ++k) {
            const auto &draw = function.draws[random() % function.draws.size()];
            points[k] = draw(random);
            const auto [x, y] = points[k];
            results[k] = function.scalar(x, y);
            const double nearest = reference(function.exact, points[k]);
            if (reference.is_exact(nearest) && !same_bits(nearest, results[k]))
                fault(function.name, points[k], "not exact");
            const double error = reference.error(results[k], nearest);
            if (std::fabs(nearest) < 0x1p-1022 && nearest != 0) {
                if (error > 1) // rounded twice
                    fault(function.name, points[k], "above the limit of subnormal results");
            } else if (error > largest) {
                largest = error;
                where = points[k];
            }
        }
        compare_lanes(function, points, results);
    }
    std::printf("%-28s %.3f ulp at %a, %a\n", function.name, largest, where[0], where[1]);
    if (!(largest <= function.limit))
        fault(function.name, where, "above its limit");
}

/// Special values, whole numbers, and what lies on either side of them.
void awkward(const Function &function)
{
    std::vector<double> values = {INFINITY,
                                  NAN,
                                  0x1.fffffffffffffp1023,
                                  0x1p-1022,
                                  5e-324,
                                  1e-310,
                                  708.0,
                                  709.782712893384,
                                  710.0,
                                  744.5,
                                  746.0,
                                  308.2547,
                                  323.3,
                                  323.7,
                                  800000,
                                  1e22,
                                  1e300,
                                  0x1p-60,
                                  0.25,
                                  0.6875};
    for (int i = 0; i <= 22; ++i)
        values.insert(values.end(), {double(i), std::pow(10, i), std::ldexp(1, i)});
    for (std::size_t i = 0, n = values.size(); i < n; ++i)
        values.insert(values.end(),
                      {std::nextafter(values[i], INFINITY), std::nextafter(values[i], 0.0)});
    for (std::size_t i = 0, n = values.size(); i < n; ++i)
        values.push_back(-values[i]);
    Reference reference;
    const bool two_arguments = std::strcmp(function.name, "atan2") == 0;
    for (const double x : values)
        for (const double y : two_arguments ? values : std::vector{1.0}) {
            const double result = function.scalar(x, y);
            const double nearest = reference(function.exact, {x, y});
            const bool is_axis = x == 0 || y == 0 || std::fabs(x) == std::fabs(y);
            if ((reference.is_exact(nearest) || !std::isfinite(nearest) ||
                 (two_arguments && is_axis)) &&
                !same_bits(result, nearest))
                fault(function.name, {x, y}, "not exact");
            if (reference.error(result, nearest) >
                (std::fabs(nearest) < 0x1p-1022 ? 1 : function.limit))
                fault(function.name, {x, y}, "above its limit");
            std::array<Point, 8> points;
            std::array<double, 8> results;
            points.fill({0.5, 0.75});
            points[1] = points[6] = {x, y};
            for (std::size_t k = 0; k < 8; ++k)
                results[k] = function.scalar(points[k][0], points[k][1]);
            compare_lanes(function, points, results);
        }
}

} // namespace

int main(int argc, char **argv)
{
    if (argc < 2) {
        std::fputs("usage: elementary COUNT [SEED]\n", stderr);
        return 2;
    }
    for (const Function &function : functions()) {
        awkward(function);
        measure(function, std::atol(argv[1]), argc > 2 ? std::strtoull(argv[2], nullptr, 10) : 1);
    }
    return good ? 0 : 1;
}
