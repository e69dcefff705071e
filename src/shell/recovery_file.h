// The file that keeps what has not been saved of a document.
#pragma once

#include "files/field.h"

#include <QByteArray>
#include <QDateTime>
#include <QStringList>
#include <cstdint>
#include <cstdio>
#include <optional>
#include <string>
#include <system_error>

/// Whose content it is. The file is one line of JSON with this, and behind it the content as a file of the document's
/// kind.
struct CRecoveryHeader
{
    QString path{}; // of the document's file; empty for a document that never had one
    qint64 size = 0;
    QByteArray hash{};   // of that file as the document knew it; empty where somebody else has changed it since
    QString extension{}; // of the files of the document's kind
    QString title{};
    QDateTime time{};        // of the content
    HDDateTime dateOfFile{}; // what stands in the content for dates that the file lacked (CKsDoc); may be unset
    QStringList typed{};     // texts that were typed and are no values, with their places: they are not in the content
    qint64 contentSize = 0;  // and hash: of what is kept, as the file that was read says
    QByteArray contentHash{};
};

/// The text of such a file.
std::string RecoveryText(const CRecoveryHeader& header, const std::string& content);
/// Puts it into the place of a file (safe_file.h).
std::error_code WriteRecoveryFile(const QString& file, const CRecoveryHeader& header, const std::string& content);
/// Reads such a file, and what it holds into `content` if that is asked for. Nothing for one that is not, to the last
/// byte, as it was written.
std::optional<CRecoveryHeader> ReadRecoveryFile(const QString& file, std::string* content = nullptr);
/// The same of a stream of `fileSize` bytes.
std::optional<CRecoveryHeader> ReadRecovery(std::FILE* stream, std::uintmax_t fileSize, std::string* content = nullptr);

/// The header alone, of a file that may hold anything behind it.
std::optional<CRecoveryHeader> ReadRecoveryHeader(const QString& file);

/// SHA-256 of an ordinary file's content; empty when it cannot be read.
QByteArray FileHash(const QString& path);
