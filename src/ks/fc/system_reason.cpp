#include "ks/fc/system_reason.h"

#include <QCoreApplication>
#include <QFileDevice>

namespace {

struct Reason
{
    std::errc condition;
    const char* text;
};

struct SystemReason
{
    Q_DECLARE_TR_FUNCTIONS(SystemReason)
};

// The texts follow a colon: no capital, no full stop.
constexpr Reason reasons[] = {
    {std::errc::no_space_on_device, QT_TRANSLATE_NOOP("SystemReason", "no space is left on the device")},
    {std::errc::read_only_file_system, QT_TRANSLATE_NOOP("SystemReason", "the file system is read-only")},
    {std::errc::permission_denied, QT_TRANSLATE_NOOP("SystemReason", "permission denied")},
    {std::errc::operation_not_permitted, QT_TRANSLATE_NOOP("SystemReason", "the operation is not permitted")},
    {std::errc::no_such_file_or_directory, QT_TRANSLATE_NOOP("SystemReason", "there is no such file or folder")},
    {std::errc::not_a_directory, QT_TRANSLATE_NOOP("SystemReason", "a part of the path is no folder")},
    {std::errc::is_a_directory, QT_TRANSLATE_NOOP("SystemReason", "it is a folder")},
    {std::errc::operation_not_supported, QT_TRANSLATE_NOOP("SystemReason", "it is not an ordinary file")},
    {std::errc::io_error, QT_TRANSLATE_NOOP("SystemReason", "the device reports an input or output error")},
    {std::errc::file_too_large, QT_TRANSLATE_NOOP("SystemReason", "the file would be too large")},
    {std::errc::filename_too_long, QT_TRANSLATE_NOOP("SystemReason", "the name is too long")},
    {std::errc::too_many_symbolic_link_levels, QT_TRANSLATE_NOOP("SystemReason", "the link leads in a circle")},
    {std::errc::too_many_files_open, QT_TRANSLATE_NOOP("SystemReason", "too many files are open")},
    {std::errc::device_or_resource_busy, QT_TRANSLATE_NOOP("SystemReason", "another program is using it")},
};

#ifdef EDQUOT
constexpr int QuotaExceeded = EDQUOT; // no std::errc stands for it
#else
constexpr int QuotaExceeded = 0;
#endif

CString Translated(const char* text)
{
    return QCoreApplication::translate("SystemReason", text);
}

CString QuotaText()
{
    return SystemReason::tr("your disk quota is used up");
}

CString Sentence(CString phrase)
{
    if (!phrase.isEmpty())
        phrase.front() = phrase.front().toUpper();
    return SystemReason::tr("%1.").arg(phrase);
}

} // namespace

CString KsSystemSentence(std::error_code error)
{
    return Sentence(KsSystemReason(error));
}

CString KsSystemReason(std::error_code error)
{
    for (const Reason& reason : reasons)
        if (error == reason.condition)
            return Translated(reason.text);
    if (QuotaExceeded != 0 && error.value() == QuotaExceeded && error.category() == std::generic_category())
        return QuotaText();
    return QString::fromLocal8Bit(error.message());
}

CString KsSystemReason(const QFileDevice& file)
{
    // Qt keeps the system's text only, not its number.
    const CString text = file.errorString();
    CString phrase = text;
    for (const Reason& reason : reasons)
        if (text == qt_error_string(int(reason.condition)))
            phrase = Translated(reason.text);
    if (QuotaExceeded != 0 && text == qt_error_string(QuotaExceeded))
        phrase = QuotaText();
    return Sentence(phrase);
}
