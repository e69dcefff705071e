// A structure of the parameter-file library with an owner, from a file and into one.
#pragma once

#include "base/result.h"
#include "files/safe_file.h"
#include "tql/tql.h"

#include <string>
#include <utility>

/// Owns a loaded or created structure.
class TqlStructure
{
public:
    explicit TqlStructure(tqlHandle handle) : m_handle(handle) {}
    TqlStructure(TqlStructure&& other) noexcept : m_handle(std::exchange(other.m_handle, nullptr)) {}
    TqlStructure& operator=(TqlStructure&& other) noexcept
    {
        std::swap(m_handle, other.m_handle);
        return *this;
    }
    ~TqlStructure()
    {
        if (m_handle)
            tqlClose(&m_handle);
    }
    tqlHandle Get() const { return m_handle; }

private:
    tqlHandle m_handle;
};

/// Parses a parameter file; the error is the parser's sentence with file, line and column (and the system's reason
/// against reading it), and, for whoever says it in another language, its report. `version` is the content that was
/// parsed.
Result<TqlStructure> ParseFile(const std::string& path, TqlSyntaxError* report = nullptr,
                               FileVersion* version = nullptr);
/// Likewise a text; `name` stands for the file in messages.
Result<TqlStructure> ParseText(std::string text, const std::string& name);

/// The error of content that no reader could take back, so that the library makes no text of it. `path`: of the file
/// that is not written therefore.
Error NoText(const std::string& path = {});
/// The text of what was built; an error when no file can hold it.
Result<std::string> TextOf(tqlHandle built);
/// Puts what was built into the place of a file (safe_file.h).
Result<WriteReport> SaveStructure(tqlHandle built, const std::string& path, const SafeFileOptions& options = {});
