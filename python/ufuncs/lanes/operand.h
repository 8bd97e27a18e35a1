// How one argument of a library function is taken from, or put into, a row of a NumPy array.
//
// NumPy hands a loop the first row of every operand, the bytes from row to row, and how the values
// of a row (its core) lie in memory. The library wants the values of a row side by side: a row that
// lies so is handed over as it is, any other goes through a small array on the stack.
#pragma once

#include "vantrel.h"

#include <Python.h>
#include <numpy/npy_common.h>

#include <algorithm>
#include <climits>
#include <cstddef>
#include <limits>
#include <numpy/ndarraytypes.h>
#include <type_traits>

/// A parameter that is not handed over but counted: the first dimension of the next operand.
struct Count {
    int n;
};

/// A spectrum that may be missing: an operand with a core of 31 values or of none.
struct Optional {
    const double *values;
};

/// Room for the largest core that is copied: four curves of 31 weights.
constexpr int kLargestCore = 4 * VANTREL_BANDS;

struct Operand {
    char *row = nullptr;
    npy_intp step = 0;       ///< bytes to the next row
    npy_intp counts[2] = {}; ///< the shape of the core, as a matrix
    npy_intp strides[2] = {};

    npy_intp size() const { return counts[0] * counts[1]; }

    bool side_by_side(npy_intp width) const
    {
        return (counts[1] == 1 || strides[1] == width) &&
               (counts[0] == 1 || strides[0] == counts[1] * width);
    }

    /// Calls visit(i, address) for the values of the core in order. No function looks further than
    /// the room of a copy, however long its core.
    template <class Visit> void each(Visit visit) const
    {
        for (npy_intp i = 0, value = 0; i < counts[0]; ++i)
            for (npy_intp j = 0; j < counts[1] && value < kLargestCore; ++j, ++value)
                visit(value, row + i * strides[0] + j * strides[1]);
    }
};

template <class Element> constexpr char type_number()
{
    if constexpr (std::is_same_v<Element, double>)
        return NPY_DOUBLE;
    else if constexpr (std::is_same_v<Element, float>)
        return NPY_FLOAT;
    else if constexpr (std::is_same_v<Element, int>)
        return NPY_INT;
    else if constexpr (std::is_same_v<Element, bool>)
        return NPY_BOOL;
    else {
        static_assert(std::is_same_v<Element, unsigned>);
        return NPY_UINT;
    }
}

inline int saturated(npy_int64 value)
{
    return static_cast<int>(std::clamp<npy_int64>(value, INT_MIN, INT_MAX));
}

/// What stands in an output for a row that the library refuses.
template <class Element> constexpr Element refused()
{
    if constexpr (std::is_floating_point_v<Element>)
        return std::numeric_limits<Element>::quiet_NaN();
    else
        return static_cast<Element>(-1);
}

/// A number handed over by value. Integers are 64 bits wide in NumPy; rows with others than
/// an int holds get no result.
template <class P> struct Argument : Operand {
    static_assert(std::is_arithmetic_v<P> || std::is_enum_v<P>);
    static constexpr bool operand = true, output = false;
    static constexpr char type = std::is_floating_point_v<P> ? NPY_DOUBLE : NPY_INT64;

    bool usable() const { return true; }
    P get()
    {
        if constexpr (std::is_floating_point_v<P>)
            return *reinterpret_cast<const double *>(row);
        else
            return static_cast<P>(saturated(*reinterpret_cast<const npy_int64 *>(row)));
    }
    void put(bool) {}
};

/// An array, or a record of doubles, that is read.
template <class P> struct Argument<const P *> : Operand {
    static constexpr bool operand = true, output = false;
    using Element = std::conditional_t<std::is_same_v<P, int>, int, double>;
    static constexpr char type = std::is_same_v<P, int> ? NPY_INT64 : NPY_DOUBLE;

    bool usable()
    {
        direct = type == NPY_DOUBLE && side_by_side(sizeof(double));
        return true;
    }
    const P *get()
    {
        if (direct)
            return reinterpret_cast<const P *>(row);
        each([this](npy_intp i, const char *value) {
            if constexpr (std::is_same_v<P, int>)
                copy[i] = saturated(*reinterpret_cast<const npy_int64 *>(value));
            else
                copy[i] = *reinterpret_cast<const double *>(value);
        });
        return reinterpret_cast<const P *>(copy);
    }
    void put(bool) {}

    bool direct = false;
    Element copy[kLargestCore];
};

template <> struct Argument<Optional> : Argument<const double *> {
    bool usable()
    {
        return Argument<const double *>::usable() && (size() == 0 || size() == VANTREL_BANDS);
    }
    Optional get() { return {size() ? Argument<const double *>::get() : nullptr}; }
};

template <> struct Argument<const POLWEIGHTSTRUCT *> : Argument<const double *> {
    const POLWEIGHTSTRUCT *get()
    {
        const double *curve = Argument<const double *>::get();
        curves = {curve, curve + VANTREL_BANDS, curve + 2 * VANTREL_BANDS,
                  curve + 3 * VANTREL_BANDS};
        return &curves;
    }
    POLWEIGHTSTRUCT curves = {};
};

/// An array, or a record of doubles, that is written.
template <class P> struct Argument<P *> : Operand {
    static constexpr bool operand = true, output = true;
    using Element = std::conditional_t<std::is_class_v<P>, double, P>;
    static constexpr char type = type_number<Element>();

    bool usable()
    {
        direct = side_by_side(sizeof(Element));
        return direct || size() <= kLargestCore;
    }
    P *get() { return reinterpret_cast<P *>(direct ? row : reinterpret_cast<char *>(copy)); }
    void put(bool success)
    {
        if (direct && success)
            return;
        each([this, success](npy_intp i, char *value) {
            *reinterpret_cast<Element *>(value) = success ? copy[i] : refused<Element>();
        });
    }

    bool direct = false;
    Element copy[kLargestCore];
};

template <> struct Argument<Count> : Operand {
    static constexpr bool operand = false, output = false;
    static constexpr char type = 0;
    bool usable() const { return counts[0] <= INT_MAX; }
    Count get() const { return {static_cast<int>(counts[0])}; }
    void put(bool) {}
};

/// What a function returns, where that is its result.
template <class R> struct Returned : Argument<R *> {
};
template <> struct Returned<void> {
    static constexpr bool operand = false;
};
