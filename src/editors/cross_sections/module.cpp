#include "editors/cross_sections/module.h"

#include "editors/cross_sections/view.h"
#include "files/extensions.h"
#include "grid/grid_texts.h"

#include <QCoreApplication>

namespace {

struct CrossSectionTexts
{
    Q_DECLARE_TR_FUNCTIONS(CrossSectionTexts)
};

CString DocumentStrings()
{
    const QStringList strings{"Kvr_Help.chm",
                              CrossSectionTexts::tr("Sections"),
                              CrossSectionTexts::tr("KVR Cross Sections"),
                              CrossSectionTexts::tr("KVR Cross Sections") +
                                  QStringLiteral(" (*%1)").arg(CrossSectionExtension),
                              QLatin1String(CrossSectionExtension),
                              "CrossSections.Document",
                              "CrossSections Document"};
    return strings.join(u'\n');
}

std::vector<CKsToolBarButton> Buttons()
{
    return {{CrossSectionCommand::Previous, ":/cross_sections/previous.svg",
             CrossSectionTexts::tr("Shows the cross section above\nPrevious Cross Section")},
            {CrossSectionCommand::Next, ":/cross_sections/next.svg",
             CrossSectionTexts::tr("Shows the cross section below\nNext Cross Section")},
            {},
            {Command::InsertLine, ":/cross_sections/insert.svg",
             CrossSectionTexts::tr("Adds a cross section or a point below the current one\nInsert Line")},
            {Command::DeleteLine, ":/cross_sections/delete.svg",
             CrossSectionTexts::tr("Deletes the selected cross sections or points\nDelete Lines")}};
}

} // namespace

const KsSingleEditor& CrossSectionEditor()
{
    static const KsSingleEditor editor{.texts = "Kavo0_xs",
                                       .load = &GridTexts::Load,
                                       .documentResource = 6953,
                                       .bitmap = 6965,
                                       .documentStrings = DocumentStrings,
                                       .classes = {[] { return new CCrossSectionDoc; },
                                                   [] { return new CKsMDIChildWnd; },
                                                   [] { return new CCrossSectionView; }},
                                       .name = [] { return CrossSectionTexts::tr("Cross Sections"); },
                                       .toolBarName = [] { return CrossSectionTexts::tr("KVR Cross Section Tools"); },
                                       .buttons = Buttons};
    return editor;
}
