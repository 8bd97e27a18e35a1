// Every exported function in a form that a table can drive: arguments as lists of numbers.
#pragma once

#include "vantrel.h"

#include <algorithm>
#include <cstddef>
#include <cstring>
#include <functional>
#include <limits>
#include <string>
#include <type_traits>
#include <utility>
#include <vector>

/// One argument of a call. An output stands between guards and is filled with a pattern, so that
/// what a function wrote, left alone, or wrote beyond the end can be told. An input has memory of
/// just its size, so that AddressSanitizer sees what is read beyond it.
struct Slot {
    std::vector<double> values; ///< an input, or what an output received
    std::string text;           ///< what an output of wide characters received
    bool output = false;
    bool null = false;
    bool written = false;
    bool overrun = false;
    const Slot *in_place = nullptr; ///< the input of its type in whose array an output goes
    std::vector<std::byte> memory;

    static constexpr std::size_t kGuard = 64;
    static constexpr std::byte kPattern{0xA5};
};

/// How an argument is declared.
struct Argument {
    char kind = 'a'; ///< a array, k illuminant/observer, s status, r response, d double, i int
    std::size_t count = 1;
    bool output = false;
    bool nullable = false;
    bool unchecked = false;
    std::string reported = "0"; ///< the invariant that the checking build names; "-" for nothing
};

struct Function {
    std::string name;
    std::function<double(std::vector<Slot> &)> call;
    std::vector<Argument> arguments;
    std::string file; ///< where the library defines it

    /// The signature gives the arguments as tokens in declared order: `N` input array, `>N` output
    /// array, `k` illuminant/observer, `s` status, `r` response, `d` double, `i` int; suffix `?`:
    /// null is allowed, `!`: the caller's duty, `=EXPRESSION`: what is reported of it.
    Function(const char *name, std::function<double(std::vector<Slot> &)> call = nullptr,
             const char *signature = "");

    /// Slots of the right sizes, inputs all zero.
    std::vector<Slot> slots() const;
};

const std::vector<Function> &functions();
const Function *find_function(const std::string &name);

/// A number as an array element; integers saturate.
template <class Element> Element element_of(double value)
{
    using Limits = std::numeric_limits<Element>;
    if constexpr (std::is_integral_v<Element>) {
        if (!(value > static_cast<double>(Limits::min())))
            return Limits::min();
        if (value >= static_cast<double>(Limits::max()))
            return Limits::max();
    }
    return static_cast<Element>(value);
}

/// Hands slots to parameters of type P and takes the outputs back.
template <class P> struct Parameter {
    using Pointee = std::remove_cv_t<std::remove_pointer_t<std::remove_reference_t<P>>>;
    using Element = std::conditional_t<std::is_class_v<Pointee>, double, Pointee>;
    static constexpr bool is_value = !std::is_pointer_v<P> && !std::is_reference_v<P>;
    static void prepare(Slot &slot)
    {
        if constexpr (!is_value) {
            const std::size_t guards = slot.output ? 2 * Slot::kGuard : 0;
            slot.memory.assign(slot.values.size() * sizeof(Element) + guards, Slot::kPattern);
            if (!slot.output)
                std::transform(slot.values.begin(), slot.values.end(), array(slot),
                               element_of<Element>);
        }
    }

    static P pass(Slot &slot)
    {
        if constexpr (std::is_floating_point_v<P>) {
            return slot.values.at(0);
        } else if constexpr (is_value) {
            return static_cast<P>(static_cast<long long>(slot.values.at(0)));
        } else {
            auto *pointer = reinterpret_cast<Pointee *>(array(slot));
            if constexpr (std::is_reference_v<P>)
                return *pointer;
            else
                return slot.null ? nullptr : pointer;
        }
    }

    static void take_back(Slot &slot)
    {
        if constexpr (!is_value) {
            if (!slot.output)
                return;
            const auto touched = [](std::byte b) { return b != Slot::kPattern; };
            const auto begin = slot.memory.begin() + Slot::kGuard;
            const auto end = slot.memory.end() - Slot::kGuard;
            slot.overrun = std::any_of(slot.memory.begin(), begin, touched) ||
                           std::any_of(end, slot.memory.end(), touched);
            slot.written = std::any_of(begin, end, touched);
            const Element *result = array(slot);
            if constexpr (std::is_same_v<Element, wchar_t>)
                for (std::size_t i = 0; slot.written && i < slot.values.size() && result[i]; ++i)
                    slot.text += static_cast<char>(result[i]);
            else
                std::copy(result, result + slot.values.size(), slot.values.begin());
        }
    }

    static Element *array(const Slot &slot)
    {
        const bool shared =
            slot.in_place && slot.in_place->values.size() >= slot.values.size() &&
            slot.in_place->memory.size() == slot.in_place->values.size() * sizeof(Element);
        const std::byte *begin = shared        ? slot.in_place->memory.data()
                                 : slot.output ? slot.memory.data() + Slot::kGuard
                                               : slot.memory.data();
        return reinterpret_cast<Element *>(const_cast<std::byte *>(begin));
    }
};

/// The four curves of 31 weights, one after the other.
template <> struct Parameter<const POLWEIGHTSTRUCT *> {
    static void prepare(Slot &slot) { slot.memory.resize(sizeof(POLWEIGHTSTRUCT)); }
    static const POLWEIGHTSTRUCT *pass(Slot &slot)
    {
        const double *curve = slot.values.data();
        return new (slot.memory.data()) POLWEIGHTSTRUCT{curve, curve + 31, curve + 62, curve + 93};
    }
    static void take_back(Slot &) {}
};

template <class R, class... P> std::function<double(std::vector<Slot> &)> call(R (*function)(P...))
{
    return [function](std::vector<Slot> &slots) {
        return [&]<std::size_t... I>(std::index_sequence<I...>)
        {
            double result = 1;
            (Parameter<P>::prepare(slots.at(I)), ...);
            if constexpr (std::is_void_v<R>)
                function(Parameter<P>::pass(slots.at(I))...);
            else
                result = static_cast<double>(function(Parameter<P>::pass(slots.at(I))...));
            (Parameter<P>::take_back(slots.at(I)), ...);
            return result;
        }
        (std::index_sequence_for<P...>());
    };
}
