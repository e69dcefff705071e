// Memory ends at every place where it is asked for: hdkv says so and leaves files whole.
#include "cli/commands.h"
#include "cli/hdkv.h"
#include "data/hd_support.h"
#include "granted_memory.h"

#include <iostream>
#include <streambuf>

namespace {

/// Takes what is printed without asking for memory.
struct Sink : std::streambuf
{
    std::size_t size = 0;
    int overflow(int c) override
    {
        ++size;
        return traits_type::not_eof(c);
    }
};

class Memory : public FolderTest
{
protected:
    Memory()
    {
        std::cout.rdbuf(&out);
        std::cerr.rdbuf(&err);
    }
    ~Memory() override
    {
        std::cout.rdbuf(m_cout);
        std::cerr.rdbuf(m_cerr);
    }

    /// Runs hdkv in this process with so much memory.
    int Run(std::vector<std::string> words, long grants, bool forGood = false)
    {
        words.insert(words.begin(), "hdkv");
        std::vector<char*> argv;
        for (std::string& word : words)
            argv.push_back(word.data());
        std::cout.clear();
        out.size = err.size = 0;
        GrantedMemory::refused = false;
        GrantedMemory::refusesForGood = forGood;
        GrantedMemory::granted = grants;
        const int code = Hdkv(int(argv.size()), argv.data());
        GrantedMemory::granted = GrantedMemory::unlimited;
        return code;
    }

    /// The text of the one file of the folder; empty when there is none.
    std::string OnlyFile() const
    {
        EXPECT_LE(FileCount(), 1u) << "something was left behind";
        return std::filesystem::exists(m_folder / "a.hdkv") ? Text("a.hdkv") : std::string();
    }

    Sink out, err;

private:
    std::streambuf *const m_cout = std::cout.rdbuf(), *const m_cerr = std::cerr.rdbuf();
};

} // namespace

TEST_F(Memory, EndsAnywhereWithAMessage)
{
    const std::string file = Path("a.hdkv");
    const std::string text =
        "[KAVO0_HD]\n[Global_Variables]\n[Heat_Balance]\nLatitude = 1\n[/Heat_Balance]\n"
        "[/Global_Variables]\n[InitList]\nDATA = \"\", 1, 2, 3\nDATA = \"R\", 2.5, 2, 3\nMINE = 1\n"
        "[/InitList]\n[Other]\n[/Other]\n[/KAVO0_HD]\n";
    const struct
    {
        std::vector<std::string> words;
        int code; // with all the memory it wants
        bool writes = false;
    } cases[] = {{{"check", file}, Exit::Findings},
                 {{"show", file, "InitList"}, Exit::Fine},
                 {{"show", file, "--format", "json"}, Exit::Fine},
                 {{"get", file, "Latitude"}, Exit::Fine},
                 {{"get", file, "latitude"}, Exit::Usage},
                 {{"set", file, "Latitude", "7"}, Exit::Fine, true},
                 {{"fmt", file}, Exit::Fine, true},
                 {{"new", file}, Exit::Fine, true}};
    for (const auto& c : cases) {
        const std::string before = c.words[0] == "new" ? "" : text;
        const auto prepare = [&] {
            std::filesystem::remove(m_folder / "a.hdkv");
            if (!before.empty())
                Write("a.hdkv", before);
        };
        prepare();
        EXPECT_EQ(Run(c.words, GrantedMemory::unlimited), c.code);
        const std::string made = OnlyFile();
        // Two new files differ in the time at which they were made.
        const auto isMade = [&](const std::string& now) {
            return before.empty() ? bool(LoadHDFile(file)) : now == made;
        };
        for (const bool forGood : {false, true}) {
            GrantedMemory::refused = true;
            long place = 0;
            for (; GrantedMemory::refused && !HasFailure(); ++place) {
                SCOPED_TRACE(c.words[0] + ", place " + std::to_string(place) + (forGood ? " and on" : ""));
                prepare();
                const int code = Run(c.words, place, forGood);
                const std::string after = OnlyFile();
                EXPECT_TRUE(GrantedMemory::refused || code == c.code) << code;
                EXPECT_TRUE(code == c.code || err.size > 0) << code << ": a failure that nobody is told of";
                EXPECT_LE(code, Exit::NoMemory);
                EXPECT_TRUE(after == before || isMade(after)) << after;
                EXPECT_TRUE(code != Exit::Fine || isMade(after)) << "it is not done";
            }
            EXPECT_GT(place, 100) << c.words[0];
        }
    }
}
