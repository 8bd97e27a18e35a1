#include "guard.h"

#include "settings.h"

#include <bitset>
#include <cmath>
#include <memory>

namespace {

/// Rows that are looked at, and stay near, before they are computed.
constexpr npy_intp kTogether = 64;

struct Rows {
    std::bitset<kTogether> unknown, infinite; ///< those with a not-a-number, with an infinity
    bool any = false;
};

void look_at(const Guard &guard, Operand operand, npy_intp rows, Rows &found)
{
    const npy_intp size = operand.size(), bytes = size * npy_intp(sizeof(double));
    if (guard.all_finite && operand.side_by_side(sizeof(double))) {
        const npy_intp apart = operand.step == 0 ? 1 : rows;
        if ((apart == 1 || operand.step == bytes) &&
            guard.all_finite(reinterpret_cast<const double *>(operand.row), apart * size))
            return;
    }
    for (npy_intp n = 0; n < rows; ++n, operand.row += operand.step)
        operand.each([&](npy_intp, const char *value) {
            const double x = *reinterpret_cast<const double *>(value);
            found.unknown[n] = found.unknown[n] || std::isnan(x);
            found.infinite[n] = found.infinite[n] || std::isinf(x);
            found.any = found.any || !std::isfinite(x);
        });
}

template <class Element> bool finite(const Operand &operand)
{
    bool any = false;
    operand.each([&](npy_intp, const char *value) {
        any = any || std::isfinite(*reinterpret_cast<const Element *>(value));
    });
    return any;
}

/// Whether a row of an output holds a finite value; a whole number is one.
bool finite(const Operand &operand, int type)
{
    return type == NPY_DOUBLE  ? finite<double>(operand)
           : type == NPY_FLOAT ? finite<float>(operand)
                               : true;
}

template <class Element> void fill(const Operand &operand, Element missing)
{
    operand.each([&](npy_intp, char *value) { *reinterpret_cast<Element *>(value) = missing; });
}

void make_missing(const Operand &operand, int type)
{
    switch (type) {
    case NPY_DOUBLE:
        return fill(operand, refused<double>());
    case NPY_FLOAT:
        return fill(operand, refused<float>());
    case NPY_BOOL:
        return fill(operand, npy_bool(false));
    default: // int and unsigned
        return fill(operand, refused<int>());
    }
}

/// Whether several rows at a time have been computed; they all succeed then.
bool side_by_side(const Guard &guard, char **rows, const npy_intp *dimensions,
                  const npy_intp *steps)
{
    if (!guard.lanes)
        return false;
    Operand operands[Layout::kOperands];
    const int count = static_cast<int>(guard.types.size());
    for (int i = 0; i < count; ++i)
        place(operands[i], guard.layout, i, rows, dimensions, steps);
    if (!guard.lanes(operands, dimensions[0]))
        return false;
    if (guard.layout.flags)
        for (npy_intp n = 0; n < dimensions[0]; ++n)
            *reinterpret_cast<npy_bool *>(rows[count - 1] + n * steps[count - 1]) = true;
    return true;
}

} // namespace

void guarded(char **rows, const npy_intp *dimensions, const npy_intp *steps, void *data)
{
    auto &guard = *static_cast<Guard *>(data);
    const int operands = static_cast<int>(guard.types.size());
    const Running running;

    char *at[Layout::kOperands];
    std::copy_n(rows, operands, at);
    npy_intp sizes[1 + Layout::kOperands];
    std::copy_n(dimensions, 1 + guard.core_dimensions, sizes);
    const auto operand = [&](int i, npy_intp row) {
        Operand place_of_it;
        place(place_of_it, guard.layout, i, at, sizes, steps);
        place_of_it.row += row * steps[i];
        return place_of_it;
    };

    for (npy_intp left = dimensions[0]; left > 0; left -= sizes[0]) {
        sizes[0] = std::min(left, kTogether);
        Rows found;
        for (int i = 0; i < guard.inputs; ++i)
            if (guard.types[i] == NPY_DOUBLE)
                look_at(guard, operand(i, 0), sizes[0], found);
        if (!side_by_side(guard, at, sizes, steps))
            guard.loop(at, sizes, steps, &guard.layout);
        for (npy_intp n = 0; found.any && n < sizes[0]; ++n) {
            bool missing = found.unknown[n];
            for (int i = guard.inputs; i < operands; ++i)
                missing = missing || (found.infinite[n] && finite(operand(i, n), guard.types[i]));
            for (int i = guard.inputs; missing && i < operands; ++i)
                make_missing(operand(i, n), guard.types[i]);
        }
        for (int i = 0; i < operands; ++i)
            at[i] += sizes[0] * steps[i];
    }
    // What a row divides by or overflows is its result, not a fault to warn of.
    std::feclearexcept(FE_ALL_EXCEPT);
}
