// Drives the built program: what it prints, what it complains of, how it ends.
#ifndef VANTREL_TESTS_PROGRAM_H
#define VANTREL_TESTS_PROGRAM_H

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <stdexcept>
#include <string>
#include <sys/wait.h>
#include <vector>

#include <fmt/format.h>
#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

using Json = nlohmann::json;

inline const std::string program = VANTREL_PROGRAM;
inline const std::string example = VANTREL_EXAMPLE;
inline const std::string data = VANTREL_DATA "/";

inline std::string content(const std::string &path)
{
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
}

inline std::string scratch(const std::string &name)
{
    return testing::TempDir() + "vantrel_" +
           testing::UnitTest::GetInstance()->current_test_info()->name() + "_" + name;
}

struct Outcome {
    int status; // −1 when a signal ended it
    std::string out;
    std::string err;
};

inline Outcome shell(const std::string &command)
{
    const std::string out = scratch("out"), err = scratch("err");
    // NOLINTNEXTLINE(cert-env33-c): redirections and pipes are what is tested
    const int status = std::system(("{ " + command + "; } >" + out + " 2>" + err).c_str());
    return {WIFEXITED(status) ? WEXITSTATUS(status) : -1, content(out), content(err)};
}

inline Outcome vantrel(const std::string &words) { return shell(program + " " + words); }

// What a command says in JSON; of a report the one sheet.
inline Json json_of(const std::string &words, const std::string &command = "report")
{
    const Outcome done = vantrel(command + " --format json " + words);
    EXPECT_EQ(done.status, 0) << done.err;
    Json out = Json::parse(done.out);
    EXPECT_EQ(out["command"], command.substr(0, command.find(' ')));
    return command == "report" ? out["sheets"].at(0) : out;
}

inline const Json &patch(const Json &sheet, const std::string &name)
{
    for (const Json &patch : sheet["patches"])
        if (patch["name"] == name)
            return patch;
    throw std::out_of_range(name);
}

inline std::string replaced(std::string text, const std::string &from, const std::string &to)
{
    const auto at = text.find(from);
    EXPECT_NE(at, std::string::npos) << from;
    return text.replace(at, from.size(), to);
}

// The example with one change, as a file.
inline std::string changed(const std::string &from, const std::string &to)
{
    std::string file = scratch("changed.txt");
    std::ofstream(file, std::ios::binary) << replaced(content(example), from, to);
    return file;
}

// Each request is refused in one line that begins so.
struct Refusal {
    std::string words;
    std::string complaint;
};
inline void expect_refusals(const std::string &command, const std::vector<Refusal> &refusals)
{
    for (const auto &[words, complaint] : refusals) {
        const Outcome done = vantrel(fmt::format("{} {}", command, words));
        EXPECT_EQ(done.status, 2) << words;
        EXPECT_EQ(done.out, "") << words;
        EXPECT_EQ(done.err.substr(0, complaint.size() + 9), "vantrel: " + complaint) << words;
        EXPECT_EQ(std::count(done.err.begin(), done.err.end(), '\n'), 1) << done.err;
    }
}

#endif
