// Writes the calls of the golden tables as inputs of the fuzzer into a folder. What sets state goes
// into one input with the call that follows.
#include "encoding.h"
#include "golden.h"

#include <filesystem>
#include <fstream>
#include <iostream>

namespace {

template <class Value> void append(std::string &bytes, Value value)
{
    bytes.append(reinterpret_cast<const char *>(&value), sizeof value);
}

void append(std::string &bytes, const Slot &slot, const Argument &argument)
{
    const auto &values = slot.values;
    if (argument.output) {
        append(bytes, slot.null ? kNullOutput : kOwn);
    } else if (argument.kind == 'd') {
        append(bytes, values[0]);
    } else if (argument.kind != 'a') {
        const auto value = static_cast<std::int32_t>(values[0]);
        const bool wide = value <= kWideInt || value > INT8_MAX;
        append(bytes, wide ? kWideInt : static_cast<std::int8_t>(value));
        if (wide)
            append(bytes, value);
    } else if (slot.null) {
        append(bytes, kNullInput);
    } else {
        const bool equal = std::equal(values.begin() + 1, values.end(), values.begin());
        append(bytes, equal ? kOneValue : kEachValue);
        for (std::size_t i = 0; i < (equal ? 1 : values.size()); ++i)
            append(bytes, values[i]);
    }
}

} // namespace

int main(int count, char **words)
{
    if (count != 2) {
        std::cerr << "usage: fuzz_seeds FOLDER\n";
        return 2;
    }
    const std::filesystem::path folder = words[1];
    std::filesystem::create_directories(folder);
    std::string bytes;
    for (const GoldenCase &golden : read_all_golden()) {
        const Function &function = *golden.function;
        append(bytes, static_cast<std::uint8_t>(&function - functions().data()));
        for (std::size_t i = 0; i < golden.slots.size(); ++i)
            append(bytes, golden.slots[i], function.arguments[i]);
        if (function.name.starts_with("Set"))
            continue;
        std::ofstream file(folder / golden.where, std::ios::binary);
        if (!(file << std::exchange(bytes, "")) || !file.flush()) {
            std::cerr << "cannot write " << folder / golden.where << '\n';
            return 1;
        }
    }
}
