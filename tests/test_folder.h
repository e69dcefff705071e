// A folder that nobody else has, gone with its owner.
#pragma once

#include <filesystem>
#include <random>
#include <string>

class TestFolder
{
public:
    TestFolder()
    {
        std::random_device random;
        do // until it is a name that nobody has, whoever left a folder behind
            m_path = std::filesystem::temp_directory_path() / ("kvr-test-" + std::to_string(random()));
        while (!std::filesystem::create_directory(m_path));
    }
    ~TestFolder()
    {
        std::error_code error;
        std::filesystem::permissions(m_path, std::filesystem::perms::owner_all, error);
        std::filesystem::remove_all(m_path, error);
    }
    TestFolder(const TestFolder&) = delete;
    TestFolder& operator=(const TestFolder&) = delete;

    const std::filesystem::path& Path() const { return m_path; }
    /// Path of a file in it, in UTF-8.
    std::string Path(const std::string& name) const { return m_path.string() + '/' + name; }

private:
    std::filesystem::path m_path;
};
