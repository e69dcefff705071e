// Notices when somebody else writes to a file that is open here.
#pragma once

#include "files/file_content.h"
#include "ks/fc/types.h"
#include "ks/ks_export.h"

#include <QElapsedTimer>
#include <QObject>
#include <QStringList>
#include <QTimer>
#include <optional>

/// What a file holds, beside what is known here of it.
struct KsFileSight
{
    enum Kind
    {
        Known,     // the content that is known
        Other,     // another content
        Gone,      // nothing stands there any more
        Unreadable // it is not known: `why`
    };
    Kind kind = Known;
    FileVersion version{}; // of another content
    std::error_code why{};
    std::int64_t time = 0; // when it became so, in nanoseconds since 1970
};

/// Follows one file: the system tells of changes of the file and its folder, and when the program becomes active it is
/// looked at in any case, as file systems of other machines tell nothing. The content decides, not the time. Files are
/// read in a thread of their own: the user never waits.
class KS_API CKsFileWatch : public QObject
{
    Q_OBJECT
public:
    explicit CKsFileWatch(QObject* parent);
    ~CKsFileWatch() override;

    /// From now on the file is known to hold this content, which it had when it was `seen`; none: it could not be read.
    void Expect(const CString& path, const std::optional<FileVersion>& known, const FileStatus& seen);
    const KsFileSight& Sight() const { return m_sight; }
    /// Looks at the file as soon as it has come to rest; several calls are one look.
    void LookSoon();

signals:
    /// Sight() is another.
    void Changed();
    /// The file has more names (hard links) than when it was last looked at.
    void HasMoreNames();

private:
    struct Look;
    friend class CWatchedFiles;
    static Look LookAt(const std::string& path, const FileStatus& seen, const FileVersion& version, bool isTrusted, const std::optional<FileVersion>& known);
    void Start();
    void Looked(const Look& look, int generation);
    void Take(KsFileSight sight);

    CString m_path;
    QStringList m_watched; // by the system: the file and its folder, and that of a link to it
    std::optional<FileVersion> m_known;
    FileStatus m_seen; // the file as it was last read, and what it held then
    FileVersion m_version;
    bool m_isTrusted = false; // who writes to it now makes it another by its looks
    int m_generation = 0;     // of what is expected: a look that began before is out of date
    bool m_isLooking = false, m_looksAgain = false;
    bool m_wasMissed = false; // at the last look: a file that is being replaced is there again at the next one
    QTimer m_soon;
    QElapsedTimer m_waits; // since the first call for a look that has not begun
    KsFileSight m_sight;
};
