#include "editors/common/parameter_file.h"

#include "ks/fc/syntax_error.h"
#include "ks/fc/system_reason.h"

#include <QCoreApplication>
#include <QFileInfo>
#include <QSaveFile>
#include <algorithm>

namespace {

struct ParameterFile
{
    Q_DECLARE_TR_FUNCTIONS(ParameterFile)
};

} // namespace

CString CParameterFile::SyntaxError() const
{
    TqlSyntaxError report;
    if (!tqlGetSyntaxErr(m_handle, &report))
        return {};
    tqlGetErrorGlb();
    return KsSyntaxErrorText(report);
}

CString CParameterFile::ErrorAt(const CString& path, tqlHandle node, const CString& what)
{
    return ParameterFile::tr("%1, line %2: %3")
        .arg(QFileInfo(path).fileName())
        .arg(tqlGetPosition(node).line)
        .arg(what);
}

CString WriteParameterFile(const CString& path, tqlHandle built)
{
    const std::string_view text = tqlGetText(built);
    QSaveFile file(path);
    const auto size = static_cast<qint64>(text.size());
    // A full disk may show only in the size: neither write nor flush of QSaveFile tells of every short write.
    if (file.open(QIODevice::WriteOnly) && file.write(text.data(), size) == size && file.flush() &&
        file.size() == size && file.commit())
        return {};
    const CString reason = KsSystemReason(file);
    file.cancelWriting();
    return reason;
}

CKeptSection KeepUnknown(tqlHandle section, const std::vector<std::string_view>& known)
{
    const auto isKnown = [&](tqlHandle node) {
        return std::find(known.begin(), known.end(), tqlName(node)) != known.end();
    };
    CKeptSection kept{std::string(tqlName(section)), {}, {}};
    for (int i = 1, count = tqlGetNoKeywords(section); i <= count; ++i) {
        const tqlHandle keyword = tqlKeywordByNum(section, i);
        if (!isKnown(keyword))
            kept.keywords.emplace_back(tqlName(keyword), tqlGetRawParams(keyword));
    }
    for (int i = 1, count = tqlGetNoSections(section); i <= count; ++i) {
        const tqlHandle child = tqlSectionByNum(section, i);
        if (!isKnown(child))
            kept.sections.push_back(KeepUnknown(child, {}));
    }
    return kept;
}

void WriteKept(tqlHandle built, const CKeptSection& kept)
{
    for (const auto& [name, params] : kept.keywords)
        tqlAddRawKeyword(built, name, params);
    for (const CKeptSection& section : kept.sections) {
        tqlAddSection(built, section.name);
        WriteKept(built, section);
        tqlEndSection(built);
    }
}
