#include "shell/recovery_file.h"

#include "files/private_folder.h"
#include "files/safe_file.h"
#include "ks/fc/file_name.h"

#include <QCryptographicHash>
#include <QDir>
#include <QFileInfo>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <fstream>

namespace {

constexpr int Format = 1;
constexpr std::uintmax_t LongestHeader = 64 * 1024, LongestContent = 0x7fff'ffff;

namespace Key {
constexpr QLatin1String Format("format"), Path("file"), Size("fileSize"), Hash("fileHash"), Extension("extension"),
    Title("title"), Time("time"), DateOfFile("dateOfFile"), Typed("typed"), ContentSize("size"), ContentHash("hash");
}

QByteArray HashOf(const std::string& text)
{
    QCryptographicHash hash(QCryptographicHash::Sha256);
    constexpr std::size_t most = 1 << 24; // the class counts in int
    for (std::size_t done = 0; done < text.size(); done += most)
        hash.addData(QByteArrayView(text.data() + done, qsizetype(std::min(most, text.size() - done))));
    return hash.result().toHex();
}

bool IsHash(const QString& text)
{
    constexpr qsizetype length = 64;
    return text.size() == length && QByteArray::fromHex(text.toLatin1()).size() == length / 2;
}

constexpr std::int32_t HDDateTime::*DateParts[] = {&HDDateTime::Year, &HDDateTime::Month,  &HDDateTime::Day,
                                                   &HDDateTime::Hour, &HDDateTime::Minute, &HDDateTime::Second};

/// Nothing that is no date.
HDDateTime DateFrom(const QJsonArray& parts)
{
    HDDateTime date;
    for (qsizetype i = 0; i < parts.size() && i < qsizetype(std::size(DateParts)); ++i)
        date.*DateParts[i] = parts[i].toInt();
    return date.IsValid() ? date : HDDateTime();
}

QJsonArray PartsOf(const HDDateTime& date)
{
    QJsonArray parts;
    for (const auto part : DateParts)
        parts << date.*part;
    return parts;
}

/// A header is what the program writes, or none: types, lengths, and a path that is one.
std::optional<CRecoveryHeader> FromJson(const QJsonObject& json)
{
    for (const QLatin1String key : {Key::Path, Key::Hash, Key::Extension, Key::Title, Key::Time, Key::ContentHash})
        if (!json.value(key).isString())
            return {};
    for (const QLatin1String key : {Key::Format, Key::Size, Key::ContentSize})
        if (json.value(key).toInteger(-1) < 0)
            return {};
    CRecoveryHeader header{.path = json.value(Key::Path).toString(),
                           .size = json.value(Key::Size).toInteger(),
                           .hash = json.value(Key::Hash).toString().toLatin1(),
                           .extension = json.value(Key::Extension).toString(),
                           .title = json.value(Key::Title).toString(),
                           .time = QDateTime::fromString(json.value(Key::Time).toString(), Qt::ISODateWithMs),
                           .dateOfFile = DateFrom(json.value(Key::DateOfFile).toArray()),
                           .typed = json.value(Key::Typed).toVariant().toStringList(),
                           .contentSize = json.value(Key::ContentSize).toInteger(),
                           .contentHash = json.value(Key::ContentHash).toString().toLatin1()};
    // The system takes a name up to its first zero: another file than the one that is looked at here.
    const bool isPath = !header.path.contains(QChar::Null) && QDir::isAbsolutePath(header.path) &&
                        QDir::cleanPath(header.path) == header.path && KsHasExtension(header.path, header.extension);
    const bool isWhole = json.value(Key::Format).toInteger() == Format && header.time.isValid() &&
                         header.extension.startsWith(u'.') && (header.path.isEmpty() || isPath) &&
                         (header.hash.isEmpty() || IsHash(QString::fromLatin1(header.hash))) &&
                         IsHash(QString::fromLatin1(header.contentHash));
    return isWhole ? std::optional(header) : std::nullopt;
}

std::optional<QJsonObject> ReadFirstLine(std::FILE* stream)
{
    std::string line;
    for (int next = std::fgetc(stream); next != '\n'; next = std::fgetc(stream)) {
        if (next == EOF || line.size() == LongestHeader)
            return {};
        line += char(next);
    }
    const QJsonDocument json = QJsonDocument::fromJson(QByteArray::fromStdString(line));
    return json.isObject() ? std::optional(json.object()) : std::nullopt;
}

} // namespace

std::string RecoveryText(const CRecoveryHeader& header, const std::string& content)
{
    const QJsonObject json{{Key::Format, Format},
                           {Key::Path, header.path},
                           {Key::Size, header.size},
                           {Key::Hash, QString::fromLatin1(header.hash)},
                           {Key::Extension, header.extension},
                           {Key::Title, header.title},
                           {Key::Time, header.time.toUTC().toString(Qt::ISODateWithMs)},
                           {Key::DateOfFile, PartsOf(header.dateOfFile)},
                           {Key::Typed, QJsonArray::fromStringList(header.typed)},
                           {Key::ContentSize, qint64(content.size())},
                           {Key::ContentHash, QString::fromLatin1(HashOf(content))}};
    std::string text = QJsonDocument(json).toJson(QJsonDocument::Compact).toStdString() + '\n';
    text += content;
    return text;
}

std::error_code WriteRecoveryFile(const QString& file, const CRecoveryHeader& header, const std::string& content)
{
    const std::string text = RecoveryText(header, content);
    // Not synced: it is there for when the program ends, not for when the power does, and the disk is the user's.
    const auto written = WriteFileSafely(file.toStdString(), text, {.sync = false});
    if (written)
        return {};
    return written.error().code ? written.error().code : std::make_error_code(std::errc::io_error);
}

std::optional<CRecoveryHeader> ReadRecoveryHeader(const QString& file)
{
    const Result<PrivateFile> opened = OpenPrivateFile(file.toStdString());
    const std::optional<QJsonObject> json = opened ? ReadFirstLine(opened.value().stream.get()) : std::nullopt;
    return json ? FromJson(*json) : std::nullopt;
}

std::optional<CRecoveryHeader> ReadRecoveryFile(const QString& file, std::string* content)
{
    const Result<PrivateFile> opened = OpenPrivateFile(file.toStdString());
    return opened ? ReadRecovery(opened.value().stream.get(), opened.value().size, content) : std::nullopt;
}

std::optional<CRecoveryHeader> ReadRecovery(std::FILE* stream, std::uintmax_t fileSize, std::string* content)
{
    const std::optional<QJsonObject> json = ReadFirstLine(stream);
    const std::optional<CRecoveryHeader> header = json ? FromJson(*json) : std::nullopt;
    const long start = std::ftell(stream);
    if (!header || start < 0)
        return {};
    // Its size is known before anything is read: a file may say whatever it likes.
    const auto size = std::uintmax_t(header->contentSize);
    if (size > LongestContent || fileSize != std::uintmax_t(start) + size)
        return {};
    std::string text(std::size_t(size), '\0');
    if (std::fread(text.data(), 1, text.size(), stream) != text.size() || HashOf(text) != header->contentHash)
        return {};
    if (content)
        *content = std::move(text);
    return header;
}

QByteArray FileHash(const QString& path)
{
    if (!QFileInfo(path).isFile())
        return {};
    std::ifstream file(QFileInfo(path).filesystemFilePath(), std::ios::binary);
    QCryptographicHash hash(QCryptographicHash::Sha256);
    std::string part(std::size_t(1) << 20, '\0');
    while (file.read(part.data(), std::streamsize(part.size())) || file.gcount() > 0)
        hash.addData(QByteArrayView(part.data(), qsizetype(file.gcount())));
    return file.eof() ? hash.result().toHex() : QByteArray();
}
