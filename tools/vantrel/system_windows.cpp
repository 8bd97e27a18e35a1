// Files, streams and the command line on Windows. Names are UTF-8 in the program and UTF-16 for the
// system.

#include "file.h"
#include "output_file.h"
#include "read/measurement.h"
#include "read/text.h"
#include "system.h"

#include <fmt/format.h>

#define WIN32_LEAN_AND_MEAN
#define NOMINMAX 1
#include <windows.h>

#include <shellapi.h>

#include <algorithm>
#include <cerrno>
#include <cstdio>
#include <cstring>
#include <fcntl.h>
#include <io.h>
#include <memory>
#include <optional>
#include <sys/stat.h>
#include <vector>

namespace vantrel::program {
namespace {

constexpr std::size_t kLargestFile = 512u << 20;
constexpr int kStandardOutput = 1;

using State = BY_HANDLE_FILE_INFORMATION;
std::vector<State> files_read;

std::wstring wide(const std::string &text)
{
    std::wstring out(text.size(), L'\0'); // no longer than that
    out.resize(static_cast<std::size_t>(
        MultiByteToWideChar(CP_UTF8, 0, text.data(), static_cast<int>(text.size()), out.data(),
                            static_cast<int>(out.size()))));
    return out;
}

std::string utf8(const wchar_t *text)
{
    const int size = WideCharToMultiByte(CP_UTF8, 0, text, -1, nullptr, 0, nullptr, nullptr);
    std::string out(static_cast<std::size_t>(size), '\0');
    WideCharToMultiByte(CP_UTF8, 0, text, -1, out.data(), size, nullptr, nullptr);
    out.pop_back(); // the zero at its end
    return out;
}

// Nothing where it is no file on a disk.
std::optional<State> state_of(HANDLE handle)
{
    State state{};
    if (GetFileType(handle) != FILE_TYPE_DISK || !GetFileInformationByHandle(handle, &state))
        return std::nullopt;
    return state;
}

std::optional<State> state_of(int file)
{
    return state_of(reinterpret_cast<HANDLE>( // NOLINT(performance-no-int-to-ptr)
        _get_osfhandle(file)));
}

// That of a file that may not be read, too.
std::optional<State> state_of(const std::string &path)
{
    HANDLE handle =
        CreateFileW(wide(path).c_str(), 0, FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE,
                    nullptr, OPEN_EXISTING, FILE_FLAG_BACKUP_SEMANTICS, nullptr);
    auto state = state_of(handle);
    CloseHandle(handle);
    return state;
}

bool is_same_file(const State &first, const State &second)
{
    return first.dwVolumeSerialNumber == second.dwVolumeSerialNumber &&
           first.nFileIndexHigh == second.nFileIndexHigh &&
           first.nFileIndexLow == second.nFileIndexLow;
}

bool is_unchanged(const State &before, const State &after)
{
    return before.nFileSizeHigh == after.nFileSizeHigh &&
           before.nFileSizeLow == after.nFileSizeLow &&
           CompareFileTime(&before.ftLastWriteTime, &after.ftLastWriteTime) == 0;
}

bool was_read(const State &state)
{
    return std::any_of(files_read.begin(), files_read.end(),
                       [&](const State &read) { return is_same_file(read, state); });
}

struct Close {
    void operator()(std::FILE *file) const
    {
        if (file != stdin)
            static_cast<void>(std::fclose(file));
    }
};

std::string reason_now()
{
    const DWORD error = GetLastError();
    char text[256] = "";
    FormatMessageA(FORMAT_MESSAGE_FROM_SYSTEM | FORMAT_MESSAGE_IGNORE_INSERTS, nullptr, error,
                   MAKELANGID(LANG_ENGLISH, SUBLANG_ENGLISH_US), text, sizeof text, nullptr);
    std::string out = text;
    out.erase(
        std::find_if(out.rbegin(), out.rend(), [](char c) { return c > ' ' && c != '.'; }).base(),
        out.end());
    return out.empty() ? fmt::format("error {}", error) : out;
}

std::wstring doomed; // the temporary file that goes when the user ends the program

BOOL WINAPI remove_and_end(DWORD)
{
    if (!doomed.empty())
        DeleteFileW(doomed.c_str());
    return FALSE; // as if there were no handler
}

std::string folder_of(const std::string &path)
{
    return path.substr(0, path.find_last_of("/\\:") + 1); // none where there is no separator
}

} // namespace

void prepare(char **&words)
{
    static std::vector<std::string> texts;
    static std::vector<char *> pointers;
    int count = 0;
    if (wchar_t **given = CommandLineToArgvW(GetCommandLineW(), &count)) {
        for (int i = 0; i < count; ++i)
            texts.push_back(utf8(given[i]));
        LocalFree(given);
        for (std::string &text : texts)
            pointers.push_back(text.data());
        pointers.push_back(nullptr);
        words = pointers.data();
    }
    SetConsoleOutputCP(CP_UTF8);
    for (const int stream : {0, 1, 2})
        _setmode(stream, _O_BINARY);
    SetConsoleCtrlHandler(remove_and_end, TRUE);
}

// A console that understands escape sequences.
bool is_terminal(Stream stream)
{
    HANDLE handle = GetStdHandle(stream == Stream::output ? STD_OUTPUT_HANDLE : STD_ERROR_HANDLE);
    DWORD mode = 0;
    return GetConsoleMode(handle, &mode) &&
           SetConsoleMode(handle, mode | ENABLE_VIRTUAL_TERMINAL_PROCESSING);
}

bool is_regular_file(const std::string &path)
{
    const DWORD attributes = GetFileAttributesW(wide(path).c_str());
    return attributes != INVALID_FILE_ATTRIBUTES && !(attributes & FILE_ATTRIBUTE_DIRECTORY);
}

std::vector<std::string> files_of(const std::vector<std::string> &words)
{
    std::vector<std::string> out;
    for (const std::string &word : words) {
        std::vector<std::string> fitting;
        WIN32_FIND_DATAW found;
        HANDLE search = word.find_first_of("*?") == std::string::npos
                            ? INVALID_HANDLE_VALUE // NOLINT(performance-no-int-to-ptr)
                            : FindFirstFileW(wide(word).c_str(), &found);
        for (bool more = search != INVALID_HANDLE_VALUE; more; // NOLINT(performance-no-int-to-ptr)
             more = FindNextFileW(search, &found))
            if (!(found.dwFileAttributes & FILE_ATTRIBUTE_DIRECTORY))
                fitting.push_back(folder_of(word) + utf8(found.cFileName));
        FindClose(search);
        std::sort(fitting.begin(), fitting.end());
        if (fitting.empty())
            fitting.push_back(word);
        out.insert(out.end(), fitting.begin(), fitting.end());
    }
    return out;
}

std::string read_file(const std::string &path)
{
    const std::unique_ptr<std::FILE, Close> file(path == "-" ? stdin
                                                             : _wfopen(wide(path).c_str(), L"rb"));
    const int reason = errno;
    const auto before = file ? state_of(_fileno(file.get())) : state_of(path);
    if (before) // one that cannot be read is none of an output either
        files_read.push_back(*before);
    if (!file)
        throw sheets::InputError{0, std::strerror(reason)};
    std::string text;
    char block[1 << 16];
    while (const std::size_t got = std::fread(block, 1, sizeof block, file.get())) {
        text.append(block, got);
        if (text.size() > kLargestFile)
            throw sheets::InputError{0, "larger than 512 MiB"};
    }
    if (std::ferror(file.get()))
        throw sheets::InputError{0, std::strerror(errno)};
    const auto after = state_of(_fileno(file.get()));
    if (before && after && !is_unchanged(*before, *after))
        throw sheets::InputError{0, "it was written to while it was read; try again"};
    return text;
}

OutputFile::~OutputFile()
{
    if (file >= 0 && file != kStandardOutput)
        _close(file);
    if (!temporary.empty())
        DeleteFileW(wide(temporary).c_str());
    forget_temporary();
}

std::size_t OutputFile::put(std::string_view text)
{
    const int written =
        _write(file, text.data(), static_cast<unsigned>(std::min(text.size(), kBlock)));
    if (written <= 0)
        throw OutputError{std::strerror(errno)};
    return static_cast<std::size_t>(written);
}

void OutputFile::finish()
{
    flush();
    if (file == kStandardOutput)
        return;
    if (!temporary.empty() && _commit(file) != 0)
        throw OutputError{std::strerror(errno)};
    if (_close(std::exchange(file, -1)) != 0)
        throw OutputError{std::strerror(errno)};
    if (!temporary.empty() && !MoveFileExW(wide(temporary).c_str(), wide(replaced).c_str(),
                                           MOVEFILE_REPLACE_EXISTING | MOVEFILE_WRITE_THROUGH))
        throw OutputError{reason_now()};
    forget_temporary();
}

void OutputFile::forget_temporary()
{
    temporary.clear();
    doomed.clear();
}

void OutputFile::open()
{
    const bool named = !path.empty() && path != "-";
    const auto standard_output = state_of(kStandardOutput);
    if (!named) {
        if (standard_output && was_read(*standard_output))
            throw sheets::RequestError{
                "the file behind standard output is an input; the output would write over it"};
        file = kStandardOutput;
    } else if (const int old = _wopen(wide(path).c_str(), _O_WRONLY | _O_BINARY); old >= 0) {
        const auto target = state_of(old);
        if (target) {
            _close(old);
            if (was_read(*target))
                throw sheets::RequestError{sheets::printable(path) +
                                           " is an input; the output would write over it"};
            links_cut = target->nNumberOfLinks - 1;
            open_beside(path);
        } else { // NUL, a pipe
            file = old;
        }
    } else if (errno == ENOENT) {
        open_beside(path);
    } else {
        throw OutputError{std::strerror(errno)};
    }
}

void OutputFile::open_beside(const std::string &target)
{
    replaced = target;
    const std::string folder = folder_of(target);
    std::string name;
    for (unsigned i = 0; i < 100 && file < 0; ++i) {
        name = fmt::format("{}.vantrel.{:x}.{}", folder, GetCurrentProcessId(), i);
        doomed = wide(name);
        file = _wopen(doomed.c_str(), _O_WRONLY | _O_BINARY | _O_CREAT | _O_EXCL,
                      _S_IREAD | _S_IWRITE);
        if (file < 0 && errno != EEXIST)
            break;
    }
    if (file < 0)
        throw not_made_in(folder);
    temporary = name;
}

} // namespace vantrel::program
