// Small helpers of the tables on a terminal.
#pragma once

#include "judge/advice.h"
#include "judge/colour.h"
#include "judge/paper.h"
#include "judge/stated.h"
#include "write/sink.h"

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

namespace vantrel::sheets {

constexpr std::size_t kWidestName = 40;
constexpr std::size_t kWidestInText = 30; // a line has 120 columns

// Without a minus before zero; nothing stays blank.
std::string fixed(const std::optional<double> &value, int decimals = 2);
std::string fixed(const CIELABCOORD &lab); // L*, a*, b* with spaces between

// "Paper (without ink)", "no paper (transmission)"
std::string said(const PaperChoice &paper);

// Of densities: "over Paper (without ink)", "absolute, no paper (transmission)"
std::string over(const PaperChoice &paper);

std::string said(const IlluminantChoice &choice); // with "as the file says" where it does

std::size_t characters(const std::string &text);
std::string swatch(const Rgb &rgb);

// Writes lines, none of them with spaces at its end.
class Lines {
public:
    explicit Lines(const Sink &sink) : sink(sink) {}
    void add(std::string line);

private:
    const Sink &sink;
};

void add_advice(Lines &lines, const std::string &title, const std::vector<SolidAdvice> &advice);

} // namespace vantrel::sheets
