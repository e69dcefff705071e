// A disk that forgets: what was not synced may be lost in any order, each part of it or not.
#include "files/safe_file.h"

#include "base/utf8_path.h"

#include <algorithm>
#include <functional>
#include <gtest/gtest.h>
#include <map>
#include <optional>
#include <vector>

namespace {

/// What stands on the disk, by name.
using Disk = std::map<std::string, std::string>;

class MemoryDisk : public PlatformFile
{
public:
    bool canExchange = true;
    std::size_t callsLeft = std::size_t(-1); // then the power is gone: no call does anything
    std::size_t calls = 0;

    void Put(const std::string& name, const std::string& content)
    {
        m_nodes.push_back({content, {}});
        m_names[name] = m_nodes.size() - 1;
    }
    void PutOtherName(const std::string& name, const std::string& same) { m_names[name] = m_names.at(same); }
    /// From here on changes are pending until they are synced.
    void Settle() { m_safeNames = m_names; }

    std::size_t PendingCount() const
    {
        std::size_t count = m_steps.size();
        for (const Node& node : m_nodes)
            count += node.writes.size();
        return count;
    }
    /// What is found when of the pending changes only those of the mask have arrived. A step in the folder is made
    /// whole or not at all, a write may be.
    Disk After(std::uint64_t mask) const
    {
        std::map<std::string, std::size_t> names = m_safeNames;
        const auto arrives = [&mask] { return (std::exchange(mask, mask >> 1) & 1) != 0; };
        for (const Step& step : m_steps)
            if (arrives())
                Apply(step, names);
        std::vector<std::string> contents;
        for (const Node& node : m_nodes) {
            contents.push_back(node.safe);
            for (const Change& write : node.writes)
                if (arrives())
                    write(contents.back());
        }
        Disk disk;
        for (const auto& [name, node] : names)
            disk[name] = contents[node];
        return disk;
    }

    std::error_code Status(const Path& path, FileStatus& status) override
    {
        status = {};
        return Do([&] {
            if (const auto found = m_names.find(path.string()); found != m_names.end())
                status = Describe(found->second);
        });
    }
    std::error_code ReadLink(const Path&, Path&) override { return Fail(std::errc::invalid_argument); }
    std::error_code List(const Path&, std::vector<Path>& names) override
    {
        return Do([&] {
            for (const auto& entry : m_names)
                names.emplace_back(entry.first);
        });
    }
    std::error_code CheckWritable(const Path&) override
    {
        return Do([] {});
    }
    std::error_code Open(const Path& path, Purpose, Handle& file) override
    {
        return Do([&] { file = Opened(m_names.at(path.string())); });
    }
    std::error_code Create(const Path& path, Handle& file) override
    {
        return Do([&] {
            m_nodes.emplace_back();
            Make({{path.string(), m_nodes.size() - 1}});
            file = Opened(m_nodes.size() - 1);
        });
    }
    std::error_code StatusOf(Handle file, FileStatus& status) override
    {
        return Do([&] { status = Describe(At(file).node); });
    }
    std::error_code Read(Handle file, char* buffer, std::size_t size, std::size_t& read) override
    {
        return Do([&] {
            read = Now(At(file).node).substr(std::min(At(file).place, Now(At(file).node).size())).copy(buffer, size);
            At(file).place += read;
        });
    }
    std::error_code Write(Handle file, std::string_view text, std::size_t& written) override
    {
        written = 0;
        return Do([&] {
            const std::string piece(text.substr(0, 4));
            const std::size_t place = std::exchange(At(file).place, At(file).place + piece.size());
            m_nodes[At(file).node].writes.push_back([place, piece](std::string& content) {
                content.resize(std::max(content.size(), place + piece.size()), '\0');
                content.replace(place, piece.size(), piece);
            });
            written = piece.size();
        });
    }
    std::error_code Cut(Handle file, std::uint64_t size) override
    {
        return Do([&] {
            m_nodes[At(file).node].writes.push_back([size](std::string& content) { content.resize(size, '\0'); });
        });
    }
    std::error_code Lock(Handle) override
    {
        return Do([] {});
    }
    std::error_code TakePermissions(Handle, const Path&, LostMetadata&) override
    {
        return Do([] {});
    }
    std::error_code TakeNewPermissions(Handle, const Path&) override
    {
        return Do([] {});
    }
    std::error_code Sync(Handle file) override
    {
        return Do([&] {
            Node& node = m_nodes[At(file).node];
            node.safe = Now(At(file).node);
            node.writes.clear();
        });
    }
    std::error_code Close(Handle) override
    {
        return Do([] {});
    }
    std::error_code Exchange(const Path& a, const Path& b) override
    {
        if (!canExchange)
            return Fail(std::errc::function_not_supported);
        return Do([&] { Make({{a.string(), m_names.at(b.string())}, {b.string(), m_names.at(a.string())}}); });
    }
    std::error_code Replace(const Path& from, const Path& to) override { return Rename(from, to); }
    std::error_code Rename(const Path& from, const Path& to) override
    {
        return Do([&] { Make({{to.string(), m_names.at(from.string())}, {from.string(), std::nullopt}}); });
    }
    std::error_code RenameNew(const Path& from, const Path& to) override
    {
        return m_names.contains(to.string()) ? Fail(std::errc::file_exists) : Rename(from, to);
    }
    std::error_code Remove(const Path& path) override
    {
        return Do([&] { Make({{path.string(), std::nullopt}}); });
    }
    std::error_code SyncFolder(const Path&) override
    {
        return Do([&] {
            m_safeNames = m_names;
            m_steps.clear();
        });
    }

private:
    using Change = std::function<void(std::string&)>;
    struct Node
    {
        std::string safe;
        std::vector<Change> writes;
    };
    struct OpenFile
    {
        std::size_t node, place;
    };
    using Step = std::map<std::string, std::optional<std::size_t>>; // what stands under a name from then on

    static std::error_code Fail(std::errc error) { return std::make_error_code(error); }
    template <typename Call>
    std::error_code Do(Call call)
    {
        ++calls;
        if (callsLeft == 0)
            return Fail(std::errc::io_error);
        --callsLeft;
        call();
        return {};
    }
    static void Apply(const Step& step, std::map<std::string, std::size_t>& names)
    {
        for (const auto& [name, node] : step) {
            names.erase(name);
            if (node)
                names[name] = *node;
        }
    }
    void Make(const Step& step)
    {
        Apply(step, m_names);
        m_steps.push_back(step);
    }
    Handle Opened(std::size_t node)
    {
        m_open.push_back({node, 0});
        return Handle(m_open.size() - 1);
    }
    OpenFile& At(Handle file) { return m_open.at(std::size_t(file)); }
    std::string Now(std::size_t node) const
    {
        std::string content = m_nodes[node].safe;
        for (const Change& write : m_nodes[node].writes)
            write(content);
        return content;
    }
    FileStatus Describe(std::size_t node) const
    {
        FileStatus status{.kind = FileStatus::Kind::File, .isMine = true, .inode = node + 1};
        status.size = Now(node).size();
        status.modified = std::int64_t(m_nodes[node].writes.size());
        for (const auto& entry : m_names)
            status.links += entry.second == node;
        return status;
    }

    std::vector<Node> m_nodes;
    std::map<std::string, std::size_t> m_names, m_safeNames;
    std::vector<Step> m_steps;
    std::vector<OpenFile> m_open;
};

const std::string Old = "the old content", New = "this is new, and longer than the old";

/// A way to save "a", and what has to be found after a power loss.
struct Way
{
    const char* name;
    bool exists = true, otherName = false, canExchange = true, expects = false;
    const char* renameTo = "";
    bool displaces = false; // what stands there is another program's, and the user saves all the same
};
constexpr Way ways[] = {{.name = "a new file", .exists = false},
                        {.name = "an old one"},
                        {.name = "that is known", .expects = true},
                        {.name = "that cannot be swapped", .canExchange = false},
                        {.name = "of two names", .otherName = true},
                        {.name = "that is renamed", .renameTo = "A"},
                        {.name = "that somebody has changed", .displaces = true},
                        {.name = "changed, that cannot be swapped", .canExchange = false, .displaces = true},
                        {.name = "changed, of two names", .otherName = true, .displaces = true},
                        {.name = "changed, that is renamed", .renameTo = "A", .displaces = true}};

Result<WriteReport> Save(const Way& way, MemoryDisk& disk)
{
    disk.canExchange = way.canExchange;
    if (way.exists)
        disk.Put("a", Old);
    if (way.otherName)
        disk.PutOtherName("b", "a");
    disk.Settle();
    SafeFileOptions options{.platform = &disk, .renameTo = way.renameTo};
    if (way.expects)
        options.expected = VersionOfText(Old);
    if (way.displaces) {
        options.expected = VersionOfText("what the user has seen");
        options.ask = [](const WriteQuestion&) { return WriteAnswer::Yes; };
    }
    return WriteFileSafely("a", New, options);
}

bool Stands(const Disk& disk, const std::string& name, const std::string& content)
{
    const auto found = disk.find(name);
    return found != disk.end() && found->second == content;
}

/// The file is there whole, old or new, once; of one that is written over, at least a whole copy. What nobody has seen
/// is there in any case.
bool IsWhole(const Way& way, const Disk& disk)
{
    if (way.displaces && std::ranges::none_of(disk, [](const auto& entry) { return entry.second == Old; }))
        return false;
    const bool renamed = disk.contains("A");
    if (!way.exists && !disk.contains("a"))
        return true;
    if (renamed && disk.contains("a"))
        return false;
    const char* const name = renamed ? "A" : "a";
    return (way.exists && Stands(disk, name, Old)) || Stands(disk, name, New) ||
           (way.otherName && Stands(disk, "./a.new-1", New)) || (way.otherName && Stands(disk, "a.new-1", New));
}

} // namespace

TEST(PowerLoss, LeavesTheOldOrTheNewContentWhole)
{
    std::size_t states = 0;
    for (const Way& way : ways)
        for (std::size_t calls = 0, all = 1; calls <= all; ++calls) {
            MemoryDisk disk;
            disk.callsLeft = calls;
            const auto result = Save(way, disk);
            all = calls < disk.calls ? calls + 1 : calls;
            ASSERT_LT(disk.PendingCount(), 16u);
            for (std::uint64_t mask = 0; mask < std::uint64_t(1) << disk.PendingCount(); ++mask, ++states) {
                const Disk found = disk.After(mask);
                ASSERT_TRUE(IsWhole(way, found)) << way.name << ", power lost after call " << calls << ", " << mask;
                if (!result || result.value().unconfirmed)
                    continue;
                const char* const name = *way.renameTo && !result.value().notRenamed ? way.renameTo : "a";
                ASSERT_TRUE(Stands(found, name, New)) << "said to be on the disk, " << way.name << ", " << mask;
                ASSERT_TRUE(!way.displaces || Stands(found, result.value().displaced, Old)) << way.name << ", " << mask;
            }
        }
    RecordProperty("states", int(states));
    EXPECT_GE(states, 2000u);
}
