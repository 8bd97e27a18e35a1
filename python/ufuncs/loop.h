// The loop of a generalized ufunc over a library function: one template for all of them.
#pragma once

#include "lanes/operand.h"

#include <array>
#include <cfenv>
#include <tuple>
#include <utility>

/// Where the operands of a ufunc lie among what NumPy hands to its loop; filled from the ufunc.
struct Layout {
    static constexpr int kOperands = 16;
    struct Core {
        int dimensions = 0;
        int index[2] = {}; ///< which of the loop's dimensions
        int stride = 0;    ///< where its strides begin
    };
    Core cores[kOperands] = {};
    bool flags = false; ///< a last operand tells which rows succeeded
};

inline void place(Operand &operand, const Layout &layout, int index, char **rows,
                  const npy_intp *dimensions, const npy_intp *steps)
{
    const Layout::Core &core = layout.cores[index];
    operand.row = rows[index];
    operand.step = steps[index];
    for (int d = 0; d < 2; ++d) {
        const bool there = d < core.dimensions;
        operand.counts[d] = there ? dimensions[1 + core.index[d]] : 1;
        operand.strides[d] = there ? steps[core.stride + d] : 0;
    }
}

enum class Returns { success, result };

/// How a parameter list maps to operands: the inputs in order, what the function returns, the
/// outputs in order.
template <Returns returns, class R, class... P> struct Mapping {
    static constexpr int inputs =
        (0 + ... + (Argument<P>::operand && !Argument<P>::output ? 1 : 0));
    static constexpr int result = returns == Returns::result ? 1 : 0;
    static constexpr int outputs = result + (0 + ... + (Argument<P>::output ? 1 : 0));

    /// The operand of each parameter; a Count has that of the operand after it.
    static constexpr auto operand = [] {
        constexpr bool written[] = {Argument<P>::output..., false};
        constexpr bool counted[] = {!Argument<P>::operand..., false};
        std::array<int, sizeof...(P) + 1> index = {};
        for (std::size_t i = 0, in = 0, out = inputs + result; i < sizeof...(P); ++i) {
            index[i] = static_cast<int>(written[i] ? out : in);
            if (!counted[i])
                ++(written[i] ? out : in);
        }
        return index;
    }();

    static constexpr auto types = [] {
        std::array<char, inputs + outputs> all = {};
        constexpr char type[] = {Argument<P>::type..., 0};
        constexpr bool counted[] = {!Argument<P>::operand..., false};
        for (std::size_t i = 0; i < sizeof...(P); ++i)
            if (!counted[i])
                all[operand[i]] = type[i];
        if constexpr (returns == Returns::result)
            all[inputs] = Returned<R>::type;
        return all;
    }();
};

template <auto function, Returns returns> struct Loop;

template <class R, class... P, R (*function)(P...), Returns returns>
struct Loop<function, returns> {
    using Map = Mapping<returns, R, P...>;

    static void run(char **rows, const npy_intp *dimensions, const npy_intp *steps, void *data)
    {
        each_row(rows, dimensions, steps, *static_cast<const Layout *>(data),
                 std::index_sequence_for<P...>());
        // What a row divides by or overflows is its result, not a fault to warn of.
        std::feclearexcept(FE_ALL_EXCEPT);
    }

    template <std::size_t... I>
    static void each_row(char **rows, const npy_intp *dimensions, const npy_intp *steps,
                         const Layout &layout, std::index_sequence<I...>)
    {
        std::tuple<Argument<P>...> arguments;
        (place(std::get<I>(arguments), layout, Map::operand[I], rows, dimensions, steps), ...);
        bool usable = true; // every argument is asked: it also learns how its rows lie
        ((usable = std::get<I>(arguments).usable() && usable), ...);

        const int last = Map::inputs + Map::outputs;
        char *flag = layout.flags ? rows[last] : nullptr;
        char *result = rows[Map::inputs];
        for (npy_intp n = dimensions[0]; n > 0; --n) {
            bool success = usable;
            if (usable) {
                if constexpr (returns == Returns::result) {
                    *reinterpret_cast<R *>(result) = function(std::get<I>(arguments).get()...);
                    result += steps[Map::inputs];
                } else if constexpr (std::is_void_v<R>) {
                    function(std::get<I>(arguments).get()...);
                } else {
                    success = function(std::get<I>(arguments).get()...) == 1;
                }
            } else if constexpr (returns == Returns::result) {
                *reinterpret_cast<R *>(result) = refused<R>();
                result += steps[Map::inputs];
            }
            (std::get<I>(arguments).put(success), ...);
            ((std::get<I>(arguments).row += std::get<I>(arguments).step), ...);
            if (flag) {
                *reinterpret_cast<npy_bool *>(flag) = success;
                flag += steps[last];
            }
        }
    }
};

/// One ufunc.
struct Row {
    const char *c_name;
    const char *name;
    const char *signature;
    void (*loop)(char **, const npy_intp *, const npy_intp *, void *);
    int inputs, outputs;
    const char *types; ///< NumPy's type numbers of inputs and outputs
    bool refuses;      ///< can tell which rows succeeded
};

template <auto function, Returns returns = Returns::success>
constexpr Row row(const char *c_name, const char *name, const char *signature)
{
    using L = Loop<function, returns>;
    return {c_name,
            name,
            signature,
            L::run,
            L::Map::inputs,
            L::Map::outputs,
            L::Map::types.data(),
            returns == Returns::success};
}
