// Runs the program as a shell would; the words of its command line, its environment and its files
// are arbitrary bytes. Stops where it ends in another way than it promises, where a file that it
// does not write is touched or one is left behind, and where it prints what no terminal should get.
//
// The first line holds the words, the second the variables (NAME=value), with tabs between; then
// follow the files a, b and c, with a byte 1C between. a is standard input too.
#include "read/text.h"
#include "require.h"

#include <nlohmann/json.hpp>
#include <sanitizer/common_interface_defs.h>

#include <algorithm>
#include <cctype>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <fcntl.h>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <map>
#include <string>
#include <string_view>
#include <sys/mman.h>
#include <unistd.h>
#include <vector>

int vantrel_main(int count, char **words);

namespace {

namespace fs = std::filesystem;
using Files = std::map<std::string, std::string>; // content by name

// The part before the separator; the rest stays in text.
std::string take(std::string_view &text, char separator)
{
    const std::size_t end = std::min(text.find(separator), text.size());
    const std::string part(text.substr(0, end));
    text.remove_prefix(std::min(end + 1, text.size()));
    return part;
}

std::vector<std::string> parts_of(std::string_view line)
{
    std::vector<std::string> parts;
    while (!line.empty())
        parts.push_back(take(line, '\t'));
    return parts;
}

bool may_be_set(const std::string &variable)
{
    return variable.find('=') != std::string::npos && std::isupper(variable[0]) &&
           variable.find('\0') == std::string::npos;
}

Files files_here()
{
    Files files;
    for (const auto &entry : fs::directory_iterator(".")) {
        std::ifstream file(entry.path(), std::ios::binary);
        files[entry.path().filename()] = {std::istreambuf_iterator<char>(file), {}};
    }
    return files;
}

// Where a stream goes while the program runs.
class Caught {
public:
    explicit Caught(int stream) : stream(stream), before(dup(stream)) {}
    void start() const
    {
        static_cast<void>(ftruncate(memory, 0));
        static_cast<void>(lseek(memory, 0, SEEK_SET));
        dup2(memory, stream);
    }
    std::string finish() const
    {
        dup2(before, stream);
        std::string text(static_cast<std::size_t>(lseek(memory, 0, SEEK_END)), '\0');
        text.resize(static_cast<std::size_t>(pread(memory, text.data(), text.size(), 0)));
        return text;
    }
    int real() const { return before; }

private:
    int stream, before, memory = memfd_create("caught", 0);
};

void check_complaints(std::string_view text)
{
    while (!text.empty()) {
        const std::string line = take(text, '\n');
        require(line.starts_with("vantrel: "), "a complaint without the program's name");
        require(vantrel::sheets::printable(line) == line, "a complaint cannot be printed");
    }
}

void check_output(const std::string &text, int status)
{
    require(!text.empty(), "no output");
    if (text[0] != '{' && text[0] != '[')
        return;
    const auto result = nlohmann::json::parse(text, nullptr, false);
    require(!result.is_discarded(), "the JSON is none");
    if (result.is_object() && result.contains("verdict"))
        require((result["verdict"].is_null() || result["verdict"] == "passed") == (status == 0),
                "the status is not that of the verdict");
}

// The names of the files that the words surely read.
bool is_input(const std::vector<std::string> &words, const std::string &name)
{
    for (std::size_t i = 1; i < words.size(); ++i)
        if (words[i] == name &&
            (i == 1 || words[i - 1] == "--aims" || words[i - 1] == "--tolerances"))
            return true;
    return false;
}

void check_files(const Files &before, const Files &after, const std::vector<std::string> &words,
                 int status, const std::string &printed)
{
    std::vector<std::string> changed;
    for (const auto &[name, bytes] : before)
        if (const auto file = after.find(name); file == after.end() || file->second != bytes)
            changed.push_back(name);
    for (const auto &[name, bytes] : after)
        if (!before.contains(name))
            changed.push_back(name);
    if (status > 1) {
        require(changed.empty(), "a run that was refused has changed a file");
        return;
    }
    require(changed.size() <= 1, "a run has changed several files");
    if (changed.empty())
        return;
    require(printed.empty(), "an output in two places");
    require(after.contains(changed[0]), "a file is gone");
    require(!is_input(words, changed[0]), "an input was written over");
    check_output(after.at(changed[0]), status);
}

// Each run happens in this folder, which goes at the end.
struct Folder {
    std::string path = fs::temp_directory_path() / "vantrel-fuzz-XXXXXX";
    Folder() { require(mkdtemp(path.data()) != nullptr, "no temporary folder"); }
    ~Folder()
    {
        std::error_code ignored;
        fs::remove_all(path, ignored);
    }
};

class Inside {
public:
    explicit Inside(const Folder &folder) { fs::current_path(folder.path); }
    ~Inside() { fs::current_path(before); }

private:
    fs::path before = fs::current_path();
};

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    static const Folder folder;
    static const Caught output(STDOUT_FILENO), errors(STDERR_FILENO);
    __sanitizer_set_report_fd(reinterpret_cast<void *>(static_cast<std::intptr_t>(errors.real())));

    std::string_view input(reinterpret_cast<const char *>(data), size);
    std::vector<std::string> words = parts_of(take(input, '\n'));
    const std::vector<std::string> variables = parts_of(take(input, '\n'));
    for (const std::string &word : words) // nothing outside the folder
        if (word.find('/') != std::string::npos || word.find('\0') != std::string::npos)
            return 0;
    const Inside inside(folder);
    for (const auto &entry : fs::directory_iterator("."))
        if (entry.path() != "./a" && entry.path() != "./b" && entry.path() != "./c")
            fs::remove(entry.path());
    for (const char *name : {"a", "b", "c"})
        std::ofstream(name, std::ios::binary) << take(input, '\x1c');
    const Files before = files_here();

    std::string program = "vantrel";
    std::vector<char *> pointers = {program.data()};
    std::vector<std::string> kept = words; // the command line may be changed
    for (std::string &word : kept)
        pointers.push_back(word.data());
    pointers.push_back(nullptr);
    for (const std::string &variable : variables)
        if (may_be_set(variable))
            setenv(variable.substr(0, variable.find('=')).c_str(),
                   variable.substr(variable.find('=') + 1).c_str(), 1);
    const int standard_input = open("a", O_RDONLY | O_CLOEXEC);
    dup2(standard_input, STDIN_FILENO);
    close(standard_input);
    std::rewind(stdin);

    output.start();
    errors.start();
    const int status = vantrel_main(static_cast<int>(pointers.size()) - 1, pointers.data());
    const std::string complaints = errors.finish();
    const std::string printed = output.finish();

    for (const std::string &variable : variables)
        if (may_be_set(variable))
            unsetenv(variable.substr(0, variable.find('=')).c_str());
    require(status >= 0 && status <= 3, "a status that is not promised");
    require(status <= 1 || !complaints.empty(), "a refusal without a reason");
    require(status <= 1 || printed.empty(), "a refusal with an output");
    check_complaints(complaints);
    if (!printed.empty())
        check_output(printed, status);
    check_files(before, files_here(), words, status, printed);
    return 0;
}
