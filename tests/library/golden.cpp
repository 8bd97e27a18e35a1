#include "golden.h"

#include <algorithm>
#include <climits>
#include <filesystem>
#include <fstream>
#include <iomanip>
#include <map>
#include <set>
#include <sstream>
#include <stdexcept>

namespace {

using Named = std::map<std::string, std::vector<double>>;

const std::filesystem::path kFolder = VANTREL_GOLDEN_DIR;

Named enumerators(const char *names, std::initializer_list<int> values)
{
    Named all;
    std::istringstream in(names);
    std::string name;
    for (const int value : values) {
        std::getline(in >> std::ws, name, ',');
        all[name] = {static_cast<double>(value)};
    }
    return all;
}
#define ENUMERATORS(...) enumerators(#__VA_ARGS__, {__VA_ARGS__})

std::vector<std::string> split_words(const std::string &line)
{
    std::vector<std::string> words;
    std::istringstream in(line);
    while (in >> std::ws && in.peek() != '#' && in.good()) {
        const bool quoted = in.peek() == '"';
        std::string word;
        in >> std::quoted(word);
        words.push_back(quoted ? '"' + word : word);
    }
    return words;
}

std::vector<double> parse_list(const std::string &literal, const Named &known)
{
    if (const auto it = known.find(literal); it != known.end())
        return it->second;
    std::vector<double> values;
    std::istringstream items(literal);
    for (std::string item; std::getline(items, item, ',');) {
        const std::size_t star = item.find('*');
        const int times = star == std::string::npos ? 1 : std::stoi(item.substr(0, star));
        const std::string number = item.substr(star + 1);
        std::size_t used = 0;
        values.insert(values.end(), times, std::stod(number, &used));
        if (used != number.size())
            throw std::runtime_error("not a number: " + number);
    }
    return values;
}

/// The enumerators that the tables use, and the lines `name = list` of inputs.txt.
Named read_names()
{
    Named all = ENUMERATORS(
        A_2DEG, A_10DEG, C_2DEG, C_10DEG, D50_2DEG, D50_10DEG, D65_2DEG, D65_10DEG, F2_2DEG,
        F2_10DEG, F7_2DEG, F7_10DEG, F11_2DEG, F11_10DEG, F12_2DEG, F12_10DEG, D75_2DEG, D75_10DEG,
        A_STATUS, E_STATUS, I_STATUS, T_STATUS, SPECTRAL_STATUS, SPECTRALX_STATUS, HIFI_STATUS,
        HEXACHROME_STATUS, CCR1_STATUS, CCR2_STATUS, VISUAL_RESPONSE, RED_RESPONSE, GREEN_RESPONSE,
        BLUE_RESPONSE, HIFI1_RESPONSE, HIFI2_RESPONSE, HIFI3_RESPONSE, HEXACHROME1_RESPONSE,
        HEXACHROME2_RESPONSE, NUM_RESPONSES);
    std::ifstream in(kFolder / "inputs.txt");
    for (std::string line; std::getline(in, line);)
        if (const auto words = split_words(line); words.size() == 3)
            all[words[0]] = parse_list(words[2], all);
    return all;
}

GoldenCase parse_case(std::vector<std::string> words)
{
    GoldenCase result;
    if (const auto mark = std::ranges::find(words, "!"); mark != words.end()) {
        for (auto word = mark + 1; word != words.end(); ++word)
            result.reported += (result.reported.empty() ? "" : " ") + *word;
        words.erase(mark, words.end());
    }
    if (words.size() > 2 && words[words.size() - 2] == "~") {
        result.tolerance = golden_values(words.back()).at(0);
        words.resize(words.size() - 2);
    }
    result.function = find_function(words[0]);
    if (!result.function)
        throw std::runtime_error("unknown function " + words[0]);
    result.slots = result.function->slots();

    std::size_t next = 1;
    for (Slot &slot : result.slots) {
        if (slot.output)
            continue;
        const std::string &literal = words.at(next++);
        slot.null = literal == "null";
        const std::size_t count = slot.values.size();
        if (!slot.null)
            slot.values = golden_values(literal);
        if (slot.values.size() != count)
            throw std::runtime_error("wrong number of values: " + literal);
    }
    const std::string &verb = words.at(next++);
    if (verb == "returns")
        result.returns = golden_values(words.at(next++)).at(0);
    else if (verb == "fails")
        result.returns = 0;
    else if (verb != "=")
        throw std::runtime_error("expected =, fails or returns, not " + verb);
    for (Slot &slot : result.slots)
        if (slot.output) {
            result.outputs.push_back(words.at(next++));
            slot.null = result.outputs.back() == "null";
        }
    if (next != words.size())
        throw std::runtime_error("too many words");
    return result;
}

} // namespace

std::vector<double> golden_values(const std::string &literal)
{
    static const Named names = read_names();
    return parse_list(literal, names);
}

std::vector<GoldenCase> read_all_golden()
{
    std::set<std::filesystem::path> files;
    for (const auto &entry : std::filesystem::directory_iterator(kFolder))
        if (entry.path().filename() != "inputs.txt")
            files.insert(entry.path());
    std::vector<GoldenCase> all;
    for (const auto &file : files) {
        std::ifstream in(file);
        int number = 0;
        for (std::string line; std::getline(in, line);) {
            const std::string where = file.filename().string() + ":" + std::to_string(++number);
            const auto words = split_words(line);
            if (words.empty())
                continue;
            try {
                all.push_back(parse_case(words));
                all.back().where = where;
            } catch (const std::exception &error) {
                throw std::runtime_error(where + ": " + error.what());
            }
        }
    }
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
        {'s', {-1, NUM_STATUSES, INT_MIN, INT_MAX}},
        {'r', {-1, NUM_RESPONSES, INT_MIN, INT_MAX}},
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
