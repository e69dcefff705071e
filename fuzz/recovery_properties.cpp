#include "properties.h"
#include "shell/recovery_file.h"

#include <QDir>
#include <memory>

namespace {

std::optional<CRecoveryHeader> ReadFrom(std::string text, std::string* content)
{
    const auto close = [](std::FILE* file) { std::fclose(file); };
    const std::unique_ptr<std::FILE, decltype(close)> stream(::fmemopen(text.data(), text.size(), "rb"), close);
    return stream ? ReadRecovery(stream.get(), text.size(), content) : std::nullopt;
}

/// That a file of this content, whose document has this title, comes back, and with a byte changed does not.
std::string CheckWritten(const std::string& title, const std::string& content)
{
    CRecoveryHeader header{.path = QStringLiteral("/") + QString::fromStdString(title) + QStringLiteral(".x"),
                           .size = qint64(content.size()),
                           .extension = QStringLiteral(".x"),
                           .title = QString::fromStdString(title),
                           .time = QDateTime::fromMSecsSinceEpoch(qint64(title.size()) * 1000)};
    std::string text = RecoveryText(header, content), read;
    if (const auto again = ReadFrom(text, &read)) {
        if (again->path != header.path || again->title != header.title || again->time != header.time || read != content)
            return "a recovery file comes back otherwise than it was written";
    } else if (QDir::cleanPath(header.path) == header.path && !header.path.contains(QChar::Null)) {
        return "a recovery file is not taken as it was written";
    }
    if (content.empty())
        return "";
    text[text.size() - 1 - title.size() % content.size()] ^= 1;
    return ReadFrom(text, &read) ? "a recovery file is taken with another content" : "";
}

} // namespace

std::string CheckRecovery(const std::string& text)
{
    std::string content;
    if (const auto header = ReadFrom(text, &content)) {
        std::string again;
        if (!ReadFrom(RecoveryText(*header, content), &again) || again != content)
            return "what was taken for a recovery file is none when it is written";
    }
    const std::size_t line = text.find('\n');
    return line == std::string::npos ? "" : CheckWritten(text.substr(0, line), text.substr(line + 1));
}
