// HD parameter files on disk: reading one whole, writing one whole.
#pragma once

#include "data/hd_parameters.h"
#include "files/safe_file.h"

/// Owns a loaded or created structure of the parameter-file library.
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

/// Parses a parameter file; the error is the parser's sentence with file, line and column, and, for whoever says it in
/// another language, its report.
Result<TqlStructure> ParseFile(const std::string& path, TqlSyntaxError* report = nullptr);

/// Reads a file into fresh parameters. A file without the target "KAVO0_HD" gives the defaults.
Result<HD_Parameters> LoadHDFile(const std::string& path);

/// The file's text.
std::string HDFileText(const HD_Parameters& parameters, bool everySet = false);

struct SaveOptions
{
    bool everySet = false; // write encroachment sets that hold no filled line, too
    bool sync = true;
};
Result<void> SaveHDFile(const HD_Parameters& parameters, const std::string& path, const SaveOptions& options = {});
