#include "cli/findings_text.h"
#include "cli/json_text.h"
#include "cli/terminal.h"
#include "tql/utf8.h"

#include <algorithm>

namespace {

/// Names of files may be any bytes.
std::string AsUtf8(const std::string& path)
{
    for (std::string_view rest = path; !rest.empty();) {
        const std::size_t length = tql::SequenceLength(rest);
        if (length == 0)
            return Printable(path);
        rest.remove_prefix(length);
    }
    return path;
}

/// What is known of the place in the terms of the parameters, by keys that stay.
void PutPlace(JsonWriter& json, const FileFinding& finding)
{
    Put(json, "section", finding.section);
    if (!finding.keyword.empty())
        Put(json, "keyword", finding.keyword);
    if (!finding.field.empty())
        Put(json, "field", finding.field);
    if (finding.record > 0) {
        Put(json, "record", finding.record);
        Put(json, "branch", finding.branch);
    }
    if (finding.chainage)
        Put(json, "chainage", *finding.chainage);
    if (finding.remedy != Remedy::None)
        Put(json, "fix", RemedyName(finding.remedy));
}

/// How many findings of each rule there are beyond those that are listed.
void PutNotListed(JsonWriter& json, const FileCheck& check)
{
    std::vector<std::size_t> listed(check.counts.size());
    for (const FileFinding& finding : check.findings)
        ++listed[std::size_t(finding.rule)];
    PutObject(json, "notListed", [&] {
        for (const Rule& rule : HDRules())
            if (const std::size_t number = std::size_t(rule.id); check.counts[number] > listed[number])
                Put(json, rule.code, check.counts[number] - listed[number]);
    });
}

void PutFile(JsonWriter& json, const CheckedFile& file)
{
    PutObject(json, [&] {
        Put(json, "file", AsUtf8(file.path));
        if (!file.error.empty())
            Put(json, "error", AsUtf8(file.error));
        PutArray(json, "findings", file.check.findings, [&](const FileFinding& finding) {
            const Rule& rule = RuleOf(finding.rule);
            PutObject(json, [&] {
                Put(json, "code", rule.code);
                Put(json, "severity", SeverityName(rule.severity));
                Put(json, "line", finding.line);
                Put(json, "column", finding.column);
                Put(json, "message", finding.text);
                PutPlace(json, finding);
            });
        });
        PutNotListed(json, file.check);
    });
}

/// The path as a reference in the sense of RFC 3986.
std::string UriOf(const std::string& path)
{
    constexpr char digits[] = "0123456789ABCDEF";
    std::string uri;
    for (const char c : path) {
        const auto byte = static_cast<unsigned char>(c);
        const bool isPlain = (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9') ||
                             std::string_view("-._~/").find(c) != std::string_view::npos;
        if (isPlain)
            uri += c;
        else
            uri += {'%', digits[byte >> 4], digits[byte & 15]};
    }
    return path.starts_with('/') ? "file://" + uri : uri;
}

void PutText(JsonWriter& json, const char* key, std::string_view text)
{
    PutObject(json, key, [&] { Put(json, "text", text); });
}

void PutRules(JsonWriter& json)
{
    PutArray(json, "rules", HDRules(), [&](const Rule& rule) {
        PutObject(json, [&] {
            Put(json, "id", rule.code);
            PutText(json, "shortDescription", rule.title);
            PutText(json, "fullDescription", rule.explanation);
            PutObject(json, "defaultConfiguration", [&] { Put(json, "level", SeverityName(rule.severity)); });
        });
    });
}

void PutResult(JsonWriter& json, const std::string& uri, const FileFinding& finding)
{
    const Rule& rule = RuleOf(finding.rule);
    PutObject(json, [&] {
        Put(json, "ruleId", rule.code);
        Put(json, "ruleIndex", std::size_t(rule.id));
        Put(json, "level", SeverityName(rule.severity));
        PutText(json, "message", finding.text);
        PutArray(json, "locations", std::span(&finding, 1), [&](const FileFinding& found) {
            PutObject(json, [&] {
                PutObject(json, "physicalLocation", [&] {
                    PutObject(json, "artifactLocation", [&] { Put(json, "uri", uri); });
                    PutObject(json, "region", [&] {
                        Put(json, "startLine", found.line);
                        Put(json, "startColumn", found.column);
                    });
                });
            });
        });
        PutObject(json, "properties", [&] { PutPlace(json, finding); });
    });
}

/// What could not be checked, or is not listed.
std::vector<std::pair<const char*, std::string>> Notices(const std::vector<CheckedFile>& files)
{
    std::vector<std::pair<const char*, std::string>> notices;
    for (const CheckedFile& file : files) {
        if (!file.error.empty())
            notices.emplace_back("error", AsUtf8(file.error));
        if (const std::size_t more = file.check.Count() - file.check.findings.size())
            notices.emplace_back("note", AsUtf8(file.path) + ": " + std::to_string(more) + " more are not listed");
    }
    return notices;
}

} // namespace

void PrintJson(std::ostream& stream, const std::vector<CheckedFile>& files)
{
    rapidjson::OStreamWrapper out(stream);
    JsonWriter json(out);
    PutObject(json, [&] {
        Put(json, "version", 1);
        PutArray(json, "files", files, [&](const CheckedFile& file) { PutFile(json, file); });
    });
    stream << '\n';
}

void PrintSarif(std::ostream& stream, const std::vector<CheckedFile>& files)
{
    rapidjson::OStreamWrapper out(stream);
    JsonWriter json(out);
    const auto notices = Notices(files);
    const bool isComplete = std::ranges::all_of(files, &std::string::empty, &CheckedFile::error);
    const auto run = [&] {
        PutObject(json, "tool", [&] {
            PutObject(json, "driver", [&] {
                Put(json, "name", "hdkv");
                Put(json, "version", KVR_VERSION);
                PutRules(json);
            });
        });
        Put(json, "columnKind", "unicodeCodePoints");
        PutArray(json, "invocations", std::span(&isComplete, 1), [&](bool isDone) {
            PutObject(json, [&] {
                Put(json, "executionSuccessful", isDone);
                PutArray(json, "toolExecutionNotifications", notices, [&](const auto& notice) {
                    PutObject(json, [&] {
                        Put(json, "level", notice.first);
                        PutText(json, "message", notice.second);
                    });
                });
            });
        });
        json.Key("results");
        json.StartArray();
        for (const CheckedFile& file : files)
            for (const FileFinding& finding : file.check.findings)
                PutResult(json, UriOf(file.path), finding);
        json.EndArray();
    };
    PutObject(json, [&] {
        Put(json, "$schema", "https://json.schemastore.org/sarif-2.1.0.json");
        Put(json, "version", "2.1.0");
        PutArray(json, "runs", std::span(&run, 1), [&](const auto& only) { PutObject(json, only); });
    });
    stream << '\n';
}
