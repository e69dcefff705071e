#include "ks/fc/system_reason.h"

#include <QCoreApplication>
#include <cerrno>

namespace {

struct Reason
{
    std::error_condition condition;
    const char* text;
};

// The texts follow a colon: no capital, no full stop.
const Reason reasons[] = {
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
    {std::errc::not_enough_memory, QT_TRANSLATE_NOOP("SystemReason", "there is not enough memory")},
    {std::errc::device_or_resource_busy, QT_TRANSLATE_NOOP("SystemReason", "another program is using it")},
#ifdef EDQUOT // no std::errc stands for it
    {{EDQUOT, std::generic_category()}, QT_TRANSLATE_NOOP("SystemReason", "your disk quota is used up")},
#endif
};

} // namespace

CString KsSystemReason(std::error_code error)
{
    for (const Reason& reason : reasons)
        if (error == reason.condition)
            return QCoreApplication::translate("SystemReason", reason.text);
    return QString::fromLocal8Bit(error.message());
}

CString KsSystemSentence(std::error_code error)
{
    CString phrase = KsSystemReason(error);
    if (!phrase.isEmpty())
        phrase.front() = phrase.front().toUpper();
    return QCoreApplication::translate("SystemReason", "%1.").arg(phrase);
}
