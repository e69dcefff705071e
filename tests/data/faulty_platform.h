// The system's file calls, any of which can fail or have something happen before it.
#pragma once

#include "files/platform_file.h"

#include <functional>
#include <string>
#include <vector>

class FaultyPlatform : public PlatformFile
{
public:
    /// Asked before every call, by its name; an error is the call's answer and the call is not made.
    std::function<std::error_code(const std::string& call)> fault = [](const std::string&) {
        return std::error_code();
    };
    std::size_t writeLimit = 0; // bytes a call writes at most, 0 for all
    bool canExchange = true;
    std::int64_t aged = 0; // nanoseconds by which everything is older than it is
    LostMetadata losing;   // what TakePermissions says
    std::vector<std::string> calls;

    std::error_code Status(const Path& path, FileStatus& status) override
    {
        return Aged(Do("Status", [&] { return Native().Status(path, status); }), status);
    }
    std::error_code ReadLink(const Path& path, Path& target) override
    {
        return Do("ReadLink", [&] { return Native().ReadLink(path, target); });
    }
    std::error_code List(const Path& folder, std::vector<Path>& names) override
    {
        return Do("List", [&] { return Native().List(folder, names); });
    }
    std::error_code CheckWritable(const Path& path) override
    {
        return Do("CheckWritable", [&] { return Native().CheckWritable(path); });
    }
    std::error_code Open(const Path& path, Purpose purpose, Handle& file) override
    {
        return Do("Open", [&] { return Native().Open(path, purpose, file); });
    }
    std::error_code Create(const Path& path, Handle& file) override
    {
        return Do("Create", [&] { return Native().Create(path, file); });
    }
    std::error_code StatusOf(Handle file, FileStatus& status) override
    {
        return Aged(Do("StatusOf", [&] { return Native().StatusOf(file, status); }), status);
    }
    std::error_code Read(Handle file, char* buffer, std::size_t size, std::size_t& read) override
    {
        read = 0;
        return Do("Read", [&] { return Native().Read(file, buffer, size, read); });
    }
    std::error_code Write(Handle file, std::string_view text, std::size_t& written) override
    {
        written = 0;
        return Do("Write",
                  [&] { return Native().Write(file, writeLimit ? text.substr(0, writeLimit) : text, written); });
    }
    std::error_code Cut(Handle file, std::uint64_t size) override
    {
        return Do("Cut", [&] { return Native().Cut(file, size); });
    }
    std::error_code Lock(Handle file) override
    {
        return Do("Lock", [&] { return Native().Lock(file); });
    }
    std::error_code TakePermissions(Handle file, const Path& from, LostMetadata& lost) override
    {
        return Do("TakePermissions", [&] {
            const std::error_code error = Native().TakePermissions(file, from, lost);
            if (losing.Any())
                lost = losing;
            return error;
        });
    }
    std::error_code TakeNewPermissions(Handle file, const Path& folder) override
    {
        return Do("TakeNewPermissions", [&] { return Native().TakeNewPermissions(file, folder); });
    }
    // A test cannot see what the medium has, and waits for it in vain.
    std::error_code Sync(Handle) override
    {
        return Do("Sync", [] { return std::error_code(); });
    }
    std::error_code Close(Handle file) override
    {
        const std::error_code error = Do("Close", [] { return std::error_code(); });
        const std::error_code closed = Native().Close(file); // whatever it answers
        return error ? error : closed;
    }
    std::error_code Exchange(const Path& a, const Path& b) override
    {
        return Do("Exchange", [&] {
            return canExchange ? Native().Exchange(a, b) : std::make_error_code(std::errc::function_not_supported);
        });
    }
    std::error_code Replace(const Path& from, const Path& to) override
    {
        return Do("Replace", [&] { return Native().Replace(from, to); });
    }
    std::error_code Rename(const Path& from, const Path& to) override
    {
        return Do("Rename", [&] { return Native().Rename(from, to); });
    }
    std::error_code RenameNew(const Path& from, const Path& to) override
    {
        return Do("RenameNew", [&] { return Native().RenameNew(from, to); });
    }
    std::error_code Remove(const Path& path) override
    {
        return Do("Remove", [&] { return Native().Remove(path); });
    }
    std::error_code SyncFolder(const Path&) override
    {
        return Do("SyncFolder", [] { return std::error_code(); });
    }

private:
    template <typename Call>
    std::error_code Do(const char* name, Call call)
    {
        calls.push_back(name);
        const std::error_code error = fault(name);
        return error ? error : call();
    }
    std::error_code Aged(std::error_code error, FileStatus& status) const
    {
        status.touched -= aged;
        return error;
    }
};
