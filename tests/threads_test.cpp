// Measuring from many threads at once. Built with ThreadSanitizer it also proves that no function
// writes what another reads.
#include "golden.h"

#include <gtest/gtest.h>

#include <thread>

namespace {

/// What a call returned and wrote, bit by bit.
std::vector<std::byte> outcome(const GoldenCase &golden)
{
    auto slots = golden.slots;
    const double result = golden.function->call(slots);
    std::vector<std::byte> bytes(sizeof result);
    std::memcpy(bytes.data(), &result, sizeof result);
    for (const Slot &slot : slots)
        if (slot.output)
            bytes.insert(bytes.end(), slot.memory.begin(), slot.memory.end());
    return bytes;
}

} // namespace

TEST(Threads, EightMeasureAtOnceWithTheSameResults)
{
    std::vector<GoldenCase> calls = one_good_call_each();
    std::erase_if(calls, [](const GoldenCase &c) { return c.function->name.starts_with("Set"); });
    std::vector<std::vector<std::byte>> alone;
    for (const GoldenCase &golden : calls)
        alone.push_back(outcome(golden));

    std::vector<int> different(8);
    {
        std::vector<std::jthread> threads;
        for (int &count : different)
            threads.emplace_back([&] {
                for (int round = 0; round < 20; ++round)
                    for (std::size_t i = 0; i < calls.size(); ++i)
                        count += outcome(calls[i]) != alone[i];
            });
    }
    EXPECT_EQ(different, std::vector<int>(8));
}
