#include "guard.h"

#include "settings.h"

#include <bitset>
#include <cmath>
#include <memory>

namespace {

/// Rows that are looked at while they are near.
constexpr npy_intp kTogether = 64;
/// Rows of a loop that finds by itself that all are finite.
constexpr npy_intp kFinite = 1024;

struct Rows {
    /// Those with a not-a-number, or a whole number that an int does not hold; with an infinity.
    std::bitset<kTogether> unknown, infinite;
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

void look_at_whole_numbers(Operand operand, npy_intp rows, Rows &found)
{
    for (npy_intp n = 0; n < rows; ++n, operand.row += operand.step)
        operand.each([&](npy_intp, const char *value) {
            const npy_int64 i = *reinterpret_cast<const npy_int64 *>(value);
            found.unknown[n] = found.unknown[n] || i != saturated(i);
            found.any = found.any || i != saturated(i);
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

void fill_missing(const Operand &operand, int type)
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

/// A call of a ufunc's loop: its rows, some after the others.
class Call {
public:
    Call(Guard &guard_of, char **first, const npy_intp *dimensions, const npy_intp *between)
        : guard(guard_of), steps(between)
    {
        std::copy_n(first, count(), at);
        std::copy_n(dimensions, 1 + guard.core_dimensions, sizes);
    }

    /// Computes the next rows. Where the loop of lanes has not seen that all inputs are finite,
    /// they are looked at: before a loop of single rows, whose output may lie over its input.
    void operator()(npy_intp rows)
    {
        sizes[0] = rows;
        const Done done = side_by_side();
        if (done == Done::finite_rows)
            return go_on(rows);
        for (npy_intp left = rows; left > 0; left -= sizes[0]) {
            sizes[0] = std::min(left, kTogether);
            Rows found;
            for (int i = 0; i < guard.inputs; ++i)
                if (guard.types[i] == NPY_DOUBLE)
                    look_at(guard, operand(i), sizes[0], found);
                else
                    look_at_whole_numbers(operand(i), sizes[0], found);
            if (done == Done::nothing)
                guard.loop(at, sizes, steps, &guard.layout);
            if (found.any)
                make_missing(found);
            go_on(sizes[0]);
        }
    }

private:
    int count() const { return static_cast<int>(guard.types.size()); }

    Operand operand(int i, npy_intp row = 0)
    {
        Operand operand;
        place(operand, guard.layout, i, at, sizes, steps);
        operand.row += row * steps[i];
        return operand;
    }

    /// Computes several rows at a time, where it can; they all succeed then.
    Done side_by_side()
    {
        if (!guard.lanes)
            return Done::nothing;
        Operand operands[Layout::kOperands];
        for (int i = 0; i < count(); ++i)
            operands[i] = operand(i);
        const Done done = guard.lanes->run(operands, sizes[0]);
        for (npy_intp n = 0; done != Done::nothing && guard.layout.flags && n < sizes[0]; ++n)
            *reinterpret_cast<npy_bool *>(at[count() - 1] + n * steps[count() - 1]) = true;
        return done;
    }

    void make_missing(const Rows &found)
    {
        for (npy_intp n = 0; n < sizes[0]; ++n) {
            bool missing = found.unknown[n];
            for (int i = guard.inputs; i < count(); ++i)
                missing = missing || (found.infinite[n] && finite(operand(i, n), guard.types[i]));
            for (int i = guard.inputs; missing && i < count(); ++i)
                fill_missing(operand(i, n), guard.types[i]);
        }
    }

    void go_on(npy_intp rows)
    {
        for (int i = 0; i < count(); ++i)
            at[i] += rows * steps[i];
    }

    Guard &guard;
    char *at[Layout::kOperands]; ///< the next row of each operand
    npy_intp sizes[1 + Layout::kOperands];
    const npy_intp *steps;
};

} // namespace

void guarded(char **rows, const npy_intp *dimensions, const npy_intp *steps, void *data)
{
    auto &guard = *static_cast<Guard *>(data);
    const Running running;
    const npy_intp together = guard.lanes && guard.lanes->finds_finite ? kFinite : kTogether;
    Call compute(guard, rows, dimensions, steps);
    for (npy_intp left = dimensions[0]; left > 0; left -= together)
        compute(std::min(left, together));
    // What a row divides by or overflows is its result, not a fault to warn of.
    std::feclearexcept(FE_ALL_EXCEPT);
}
