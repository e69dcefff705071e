// Files and texts into structures, and the error state.
#include "tql/bytes.h"
#include "tql/error_text.h"
#include "tql/parser.h"

#include <algorithm>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <new>

namespace tql {

namespace {

thread_local TqlError globalError = TqlError::None;

} // namespace

void SetGlobalError(TqlError code)
{
    globalError = code;
}

Text::Text(std::size_t size) : m_bytes(std::make_unique_for_overwrite<char[]>(size + 1 + ReadAhead)), m_size(size) {}

void Text::Grow(std::size_t size)
{
    Text larger(size);
    std::memcpy(larger.Data(), Data(), m_size);
    *this = std::move(larger);
}

void Text::Finish(std::size_t size)
{
    m_size = size;
    m_begin = size >= 3 && std::memcmp(Data(), "\xEF\xBB\xBF", 3) == 0 ? 3 : 0;
    Data()[size] = '\n';
    std::memset(Data() + size + 1, 0, ReadAhead);
}

void Structure::Clear()
{
    sections = {};
    nodes.clear();
    longKeywords.clear();
    text = Text();
}

namespace {

std::string FileNameOf(const std::string& path)
{
    return path.substr(path.find_last_of("/\\") + 1);
}

void FailToRead(Structure& structure, const std::string& path, std::error_code reason)
{
    TqlSyntaxError& error = structure.error;
    error.code = TqlError::Unreadable;
    error.file = FileNameOf(path);
    error.reason = reason;
    error.message = path + " cannot be read: " + ReasonText(reason);
}

void RefuseSize(Structure& structure, const std::string& path, std::uint64_t size)
{
    TqlSyntaxError& error = structure.error;
    error.code = TqlError::TooLarge;
    error.file = FileNameOf(path);
    error.line = error.column = 1;
    error.expected = {TqlPhrase::FileOfLimit};
    error.found = {TqlPhrase::LargerFile, std::to_string(size)};
    MakeMessage(error);
}

// Why a path that cannot be opened cannot, none when nothing is known against it.
std::error_code ReasonAgainst(const std::filesystem::path& path)
{
    std::error_code code;
    const auto status = std::filesystem::status(path, code);
    switch (status.type()) {
    case std::filesystem::file_type::regular:
        return {};
    case std::filesystem::file_type::not_found:
        return std::make_error_code(std::errc::no_such_file_or_directory);
    case std::filesystem::file_type::directory:
        return std::make_error_code(std::errc::is_a_directory);
    default:
        return code ? code : std::make_error_code(std::errc::operation_not_supported);
    }
}

// Reads to the end, however much the file grew or shrank since its size was asked.
bool ReadAll(std::ifstream& in, std::size_t expectedSize, Text& text)
{
    text = Text(expectedSize + 1); // one byte more shows the end without growing
    std::size_t size = 0;
    for (;;) {
        in.read(text.Data() + size, std::streamsize(text.Size() - size));
        size += std::size_t(in.gcount());
        if (in.eof())
            break;
        if (!in)
            return false;
        text.Grow(text.Size() * 2);
    }
    text.Finish(size);
    return true;
}

bool ReadFile(Structure& structure, const std::string& path)
{
    const auto native = std::filesystem::u8path(path);
    if (const std::error_code reason = ReasonAgainst(native)) {
        FailToRead(structure, path, reason);
        return false;
    }
    std::error_code code;
    const auto size = std::filesystem::file_size(native, code);
    if (!code && size > MaxFileSize) { // before memory is asked for
        RefuseSize(structure, path, size);
        return false;
    }
    errno = 0;
    std::ifstream in(native, std::ios::binary);
    if (!code && in && ReadAll(in, std::size_t(size), structure.text))
        return true;
    if (!code)
        code = errno ? std::error_code(errno, std::generic_category()) : std::make_error_code(std::errc::io_error);
    FailToRead(structure, path, code);
    return false;
}

// Fills `structure` by `read` and parses it; whatever goes wrong leaves it empty but for the report.
template <typename Read>
tqlHandle Load(const std::string& path, Read read)
{
    auto structure = std::make_unique<Structure>();
    try {
        if (!read(*structure) || !Parse(*structure, FileNameOf(path)))
            structure->Clear();
    } catch (const std::bad_alloc&) {
        structure->Clear();
        FailToRead(*structure, path, std::make_error_code(std::errc::not_enough_memory));
        structure->error.code = TqlError::TooLarge;
    }
    SetGlobalError(structure->error.code);
    return HandleOf(structure.release());
}

} // namespace
} // namespace tql

using namespace tql;

tqlHandle tqlLoadFile(const std::string& path, int /*mode*/)
{
    return Load(path, [&](Structure& structure) { return ReadFile(structure, path); });
}

tqlHandle tqlLoadText(std::string text, const std::string& name)
{
    return Load(name, [&](Structure& structure) {
        structure.text = Text(text.size());
        std::memcpy(structure.text.Data(), text.data(), text.size());
        structure.text.Finish(text.size());
        return true;
    });
}

std::string_view tqlGetSource(tqlHandle handle)
{
    Structure* const structure = AsStructure(handle);
    return structure ? std::string_view(structure->text.Data(), structure->text.Size()) : std::string_view();
}

int tqlPeekErrorGlb()
{
    return int(globalError);
}

int tqlGetErrorGlb()
{
    const int code = tqlPeekErrorGlb();
    SetGlobalError(TqlError::None);
    return code;
}

bool tqlGetSyntaxErr(tqlHandle handle, TqlSyntaxError* report)
{
    const Structure* const structure = AsStructure(handle);
    if (!structure || structure->error.code == TqlError::None || !report)
        return false;
    *report = structure->error;
    return true;
}
