// hdkv: HD parameter files on the command line.
#include "cli/hdkv.h"

#include "cli/commands.h"
#include "cli/field_text.h"
#include "cli/open_file.h"
#include "cli/terminal.h"

#include <CLI/CLI.hpp>

#include <algorithm>
#include <iostream>
#include <map>
#include <memory>
#include <new>
#include <sstream>

namespace {

/// The words behind "--" of the command "set", which are values whatever they look like; they leave argv.
std::vector<std::string> SplitLiterals(int& argc, char** argv)
{
    if (argc < 2 || std::string_view(argv[1]) != "set")
        return {};
    char** const end = argv + argc;
    char** const mark = std::find_if(argv, end, [](const char* word) { return std::string_view(word) == "--"; });
    argc = int(mark - argv);
    return mark == end ? std::vector<std::string>() : std::vector<std::string>(mark + 1, end);
}

/// What follows the keyword of "set". A value may be negative, so the parser hands over whatever it does not know.
bool TakeValues(const std::vector<std::string>& words, const std::vector<std::string>& literals,
                std::vector<std::string>& values)
{
    for (const std::string& word : words) {
        if (word.size() > 1 && word[0] == '-' && !ReadArgument(word)) {
            Complain("There is no option " + word + ". Put -- before values that begin with a dash.", Exit::Usage);
            return false;
        }
        values.push_back(word);
    }
    values.insert(values.end(), literals.begin(), literals.end());
    if (values.empty())
        Complain("set needs at least one value.", Exit::Usage);
    return !values.empty();
}

/// The values of "set" are no positionals of the parser's, see TakeValues.
class SetFormatter : public CLI::Formatter
{
public:
    std::string make_usage(const CLI::App*, std::string) const override
    {
        return "Usage: hdkv set [OPTIONS] FILE KEYWORD VALUE...\n";
    }
};

/// Says so when the first word is no command, which the parser would only call a missing one.
bool IsUnknownCommand(const CLI::App& app, int argc, char** argv)
{
    if (argc < 2 || argv[1][0] == '-')
        return false;
    std::string names;
    for (const CLI::App* command : app.get_subcommands(nullptr)) {
        if (command->get_name() == argv[1])
            return false;
        names += (names.empty() ? "" : ", ") + command->get_name();
    }
    Complain("There is no command \"" + std::string(argv[1]) + "\"; the commands are " + names + ".", Exit::Usage);
    return true;
}

struct Arguments
{
    std::vector<std::string> files;
    std::string file, list, keyword;
    Output output;
    Format format = Format::Table;
    bool checkOnly = false;
    std::string network;
    FindingsFormat findings = FindingsFormat::Text;
};

/// What the commands have in common that write over files.
void AddOutput(CLI::App& command, Output& output)
{
    command.add_option("-o,--output", output.path, "Write here instead of over FILE");
    static const std::map<std::string, HardLinks> ways{{"keep", HardLinks::Keep}, {"split", HardLinks::Split}};
    command
        .add_option_function<std::string>(
            Option::HardLinks, [&output](const std::string& way) { output.hardLinks = ways.at(way); },
            "Write a file of several names: \"keep\" gives all of them the new content, \"split\" this one alone; "
            "without it such a file is left as it is")
        ->check(CLI::IsMember(&ways).description("")) // and no numbers of them
        ->type_name("keep|split");
    command.add_flag(Option::LoseMetadata, output.loseMetadata,
                     "Write a file although its owner, group, mode, access list or attributes cannot be kept; without "
                     "it such a file is left as it is");
}

/// What was said has to arrive.
int EndOutput()
{
    std::cout.flush();
    return std::cout ? Exit::Fine : Complain("Standard output could not be written.", Exit::NotWritten);
}

/// Prints help, or what is wrong with the command line, of which it holds pieces.
int PrintAnswer(const CLI::App& app, const CLI::ParseError& error)
{
    std::ostringstream help, complaint;
    const int code = app.exit(error, help, complaint);
    std::cout << help.str();
    if (const int written = EndOutput(); written != Exit::Fine)
        return written;
    std::istringstream lines(complaint.str());
    for (std::string line; std::getline(lines, line);)
        std::cerr << Printable(line) << '\n';
    return code == 0 ? Exit::Fine : Exit::Usage;
}

int Run(int argc, char** argv)
{
    CLI::App app("Checks, shows and changes HD parameter files (.hdkv) of river network models.", "hdkv");
    app.set_version_flag("--version", "hdkv " KVR_VERSION);
    app.require_subcommand(1);
    app.footer("Exit codes: 0 fine, 1 findings, 2 usage, 3 a file could not be read, 4 a file could not be written, "
               "5 not enough memory.");
    Arguments a;

    CLI::App* const check = app.add_subcommand("check", "Report what is not in order in files, with line and column");
    check->add_option("FILE", a.files, "HD parameter files")->required();
    check->add_option("--network", a.network, "River network (.kvnw) that branches and chainages have to fit");
    const std::map<std::string, FindingsFormat> reports{
        {"text", FindingsFormat::Text}, {"json", FindingsFormat::Json}, {"sarif", FindingsFormat::Sarif}};
    check->add_option("--format", a.findings, "text, json or sarif")->transform(CLI::CheckedTransformer(reports));
    check->footer("docs/findings.md explains the codes.");

    CLI::App* const show = app.add_subcommand("show", "Print an overview of a file, or the records of one list");
    show->add_option("FILE", a.file, "HD parameter file")->required();
    show->add_option("LIST", a.list, "Name of a list section, such as InitList");
    const std::map<std::string, Format> formats{{"table", Format::Table}, {"csv", Format::Csv}, {"json", Format::Json}};
    show->add_option("--format", a.format, "table, csv or json")->transform(CLI::CheckedTransformer(formats));

    CLI::App* const get = app.add_subcommand("get", "Print a global value, one line a parameter");
    get->add_option("FILE", a.file, "HD parameter file")->required();
    get->add_option("KEYWORD", a.keyword, "Keyword, or Section/Keyword")->required();

    CLI::App* const set = app.add_subcommand("set", "Change a global value");
    set->add_option("FILE", a.file, "HD parameter file")->required();
    set->add_option("KEYWORD", a.keyword, "Keyword, or Section/Keyword")->required();
    AddOutput(*set, a.output);
    set->allow_extras();
    set->formatter(std::make_shared<SetFormatter>());
    set->footer("One value a parameter: numbers, true or false, texts; lists begin with their\n"
                "count; words behind -- are values even with a leading dash. Comments of the file are not kept.");

    CLI::App* const fmt = app.add_subcommand("fmt", "Rewrite a file in canonical form, every record included");
    fmt->add_option("FILE", a.file, "HD parameter file")->required();
    AddOutput(*fmt, a.output);
    fmt->add_flag("--check", a.checkOnly, "Write nothing; exit with 1 if the file would change");
    fmt->footer("Comments of the file are not kept.");

    CLI::App* const create = app.add_subcommand("new", "Write a new file with default values");
    create->add_option("FILE", a.file, "HD parameter file, which must not exist")->required();

    if (IsUnknownCommand(app, argc, argv))
        return Exit::Usage;
    const std::vector<std::string> literals = SplitLiterals(argc, argv);
    try {
        app.parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        return PrintAnswer(app, error);
    }

    const TerminalLines lines(std::cout, OnTerminal());
    std::vector<std::string> values;
    int code = Exit::Usage;
    if (check->parsed())
        code = Check(a.files, a.network, a.findings);
    else if (show->parsed())
        code = Show(a.file, a.list, a.format);
    else if (get->parsed())
        code = Get(a.file, a.keyword);
    else if (set->parsed() && TakeValues(set->remaining(), literals, values))
        code = Set(a.file, a.keyword, values, a.output);
    else if (fmt->parsed())
        code = Fmt(a.file, a.output, a.checkOnly);
    else if (create->parsed())
        code = New(a.file);

    const int written = EndOutput();
    return written == Exit::Fine ? code : written;
}

} // namespace

int Hdkv(int argc, char** argv)
try {
    return Run(argc, argv);
} catch (const std::bad_alloc&) {
    return ComplainNoMemory();
}
