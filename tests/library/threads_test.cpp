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
    // The threads come first: nothing that a function sets up at its first call is there before.
    constexpr std::size_t kRounds = 20;
    std::vector<std::vector<std::vector<std::byte>>> together(8);
    {
        std::vector<std::jthread> threads;
        for (auto &outcomes : together)
            threads.emplace_back([&] {
                for (std::size_t round = 0; round < kRounds; ++round)
                    for (const GoldenCase &golden : calls)
                        outcomes.push_back(outcome(golden));
            });
    }
    for (std::size_t i = 0; i < calls.size(); ++i) {
        const auto alone = outcome(calls[i]);
        for (const auto &outcomes : together)
            for (std::size_t round = 0; round < kRounds; ++round)
                EXPECT_EQ(outcomes[round * calls.size() + i], alone) << calls[i].function->name;
    }
}
