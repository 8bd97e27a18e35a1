#include "golden.h"

#include <climits>
#include <fstream>
#include <iomanip>
#include <map>
#include <set>
#include <sstream>
#include <stdexcept>

namespace {

const std::filesystem::path kFolder = VANTREL_GOLDEN_DIR;

const std::map<std::string, int> kEnumerators = {
#define NAME(enumerator)                                                                           \
    {                                                                                              \
#enumerator, enumerator                                                                    \
    }
    NAME(A_2DEG),
    NAME(A_10DEG),
    NAME(C_2DEG),
    NAME(C_10DEG),
    NAME(D50_2DEG),
    NAME(D50_10DEG),
    NAME(D65_2DEG),
    NAME(D65_10DEG),
    NAME(F2_2DEG),
    NAME(F2_10DEG),
    NAME(F7_2DEG),
    NAME(F7_10DEG),
    NAME(F11_2DEG),
    NAME(F11_10DEG),
    NAME(F12_2DEG),
    NAME(F12_10DEG),
    NAME(D75_2DEG),
    NAME(D75_10DEG),

    NAME(A_STATUS),
    NAME(E_STATUS),
    NAME(I_STATUS),
    NAME(T_STATUS),
    NAME(SPECTRAL_STATUS),
    NAME(SPECTRALX_STATUS),
    NAME(HIFI_STATUS),
    NAME(HEXACHROME_STATUS),
    NAME(CCR1_STATUS),
    NAME(CCR2_STATUS),

    NAME(VISUAL_RESPONSE),
    NAME(RED_RESPONSE),
    NAME(GREEN_RESPONSE),
    NAME(BLUE_RESPONSE),
    NAME(HIFI1_RESPONSE),
    NAME(HIFI2_RESPONSE),
    NAME(HIFI3_RESPONSE),
    NAME(HEXACHROME1_RESPONSE),
    NAME(HEXACHROME2_RESPONSE),
    NAME(NUM_RESPONSES),
#undef NAME
};

std::vector<std::string> split_words(const std::string &line)
{
    std::vector<std::string> words;
    std::istringstream in(line);
    while (in >> std::ws && in.peek() != '#' && in.good()) {
        std::string word;
        if (in.peek() == '"') {
            in >> std::quoted(word);
            word.insert(0, 1, '"');
        } else {
            in >> word;
        }
        words.push_back(word);
    }
    return words;
}

double number(const std::string &literal)
{
    if (const auto it = kEnumerators.find(literal); it != kEnumerators.end())
        return it->second;
    std::size_t used = 0;
    const double value = std::stod(literal, &used);
    if (used != literal.size())
        throw std::runtime_error("not a number: " + literal);
    return value;
}

std::vector<double> parse_list(const std::string &literal)
{
    std::vector<double> values;
    std::istringstream items(literal);
    for (std::string item; std::getline(items, item, ',');) {
        const std::size_t star = item.find('*');
        const int times = star == std::string::npos ? 1 : std::stoi(item.substr(0, star));
        values.insert(values.end(), times, number(item.substr(star + 1)));
    }
    return values;
}

// inputs.txt: `name = list`
const std::map<std::string, std::vector<double>> &inputs()
{
    static const auto all = [] {
        std::map<std::string, std::vector<double>> named;
        std::ifstream in(kFolder / "inputs.txt");
        for (std::string line; std::getline(in, line);)
            if (const auto words = split_words(line); words.size() == 3)
                named[words[0]] = parse_list(words[2]);
        return named;
    }();
    return all;
}

Expected parse_expected(const std::string &word)
{
    Expected expected;
    if (word == "unwritten")
        expected.kind = Expected::unwritten;
    else if (word == "*")
        expected.kind = Expected::anything;
    else if (word == "null")
        expected.kind = Expected::null_output;
    else if (word.front() == '"') {
        expected.kind = Expected::text;
        expected.words = word.substr(1);
    } else
        expected.values = golden_values(word);
    return expected;
}

GoldenCase parse_case(std::vector<std::string> words)
{
    GoldenCase result;
    if (words.size() > 2 && words[words.size() - 2] == "~") {
        result.tolerance = number(words.back());
        words.resize(words.size() - 2);
    }
    result.function = find_function(words[0]);
    if (!result.function)
        throw std::runtime_error("unknown function " + words[0]);
    result.slots = result.function->slots();

    const auto &arguments = result.function->arguments;
    std::size_t next = 1;
    const auto word = [&]() -> const std::string & { return words.at(next++); };
    for (std::size_t i = 0; i < arguments.size(); ++i) {
        if (arguments[i].output)
            continue;
        const std::string &literal = word();
        result.slots[i].null = literal == "null";
        if (!result.slots[i].null)
            result.slots[i].values = golden_values(literal);
        if (result.slots[i].values.size() != arguments[i].count)
            throw std::runtime_error("wrong number of values: " + literal);
    }
    const std::string &verb = word();
    if (verb == "returns")
        result.returns = number(word());
    else if (verb == "fails")
        result.returns = 0;
    else if (verb != "=")
        throw std::runtime_error("expected =, fails or returns, not " + verb);
    for (std::size_t i = 0; i < arguments.size(); ++i) {
        if (!arguments[i].output)
            continue;
        result.outputs.push_back(parse_expected(word()));
        const Expected &expected = result.outputs.back();
        result.slots[i].null = expected.kind == Expected::null_output;
        if (expected.kind == Expected::numbers && expected.values.size() != arguments[i].count)
            throw std::runtime_error("wrong number of expected values");
    }
    if (next != words.size())
        throw std::runtime_error("too many words");
    return result;
}

} // namespace

std::vector<double> golden_values(const std::string &literal)
{
    const auto it = inputs().find(literal);
    return it != inputs().end() ? it->second : parse_list(literal);
}

std::vector<GoldenCase> read_golden(const std::filesystem::path &file)
{
    std::vector<GoldenCase> cases;
    std::ifstream in(file);
    int number = 0;
    for (std::string line; std::getline(in, line);) {
        const std::string where = file.filename().string() + ":" + std::to_string(++number);
        const auto words = split_words(line);
        if (words.empty())
            continue;
        try {
            cases.push_back(parse_case(words));
            cases.back().where = where;
        } catch (const std::exception &error) {
            throw std::runtime_error(where + ": " + error.what());
        }
    }
    return cases;
}

std::vector<GoldenCase> read_all_golden()
{
    std::vector<std::filesystem::path> files;
    for (const auto &entry : std::filesystem::directory_iterator(kFolder))
        if (entry.path().filename() != "inputs.txt")
            files.push_back(entry.path());
    std::sort(files.begin(), files.end());
    std::vector<GoldenCase> all;
    for (const auto &file : files)
        for (auto &golden : read_golden(file))
            all.push_back(std::move(golden));
    return all;
}

std::vector<GoldenCase> one_good_call_each()
{
    std::vector<GoldenCase> calls;
    std::set<std::string> seen;
    for (GoldenCase &golden : read_all_golden())
        if (golden.returns != 0 && seen.insert(golden.function->name).second)
            calls.push_back(std::move(golden));
    return calls;
}

std::vector<std::vector<Slot>> spoilt_calls(const GoldenCase &good, std::size_t argument)
{
    static const std::map<char, std::vector<double>> bad_indices = {
        {'k', {-1, NUM_ILLUM_OBS, INT_MIN, INT_MAX}},
        {'s', {-1, 10, INT_MIN, INT_MAX}},
        {'r', {-1, 9, INT_MIN, INT_MAX}},
    };
    const Argument &declared = good.function->arguments[argument];
    std::vector<std::vector<Slot>> calls;
    if (declared.unchecked)
        return calls;
    if (declared.kind == 'a' && !declared.nullable) {
        calls.push_back(good.slots);
        calls.back()[argument].null = true;
    }
    if (const auto bad = bad_indices.find(declared.kind); bad != bad_indices.end())
        for (double index : bad->second) {
            calls.push_back(good.slots);
            calls.back()[argument].values[0] = index;
        }
    return calls;
}
