// Finding a page, a field or a column by whatever somebody calls it: by the words of any of the program's languages,
// and by the keyword that it has in the file.
#pragma once

#include "ks/fc/change_place.h"

#include <QPointer>
#include <QString>
#include <QWidget>
#include <optional>
#include <vector>

class CDlgPropertySheet;
class CKavo0_hdDoc;

struct FoundField
{
    int tab;                // of the page
    ChangePlace place = {}; // nothing for the page itself
    QString title = {}, page = {}, keyword = {};
    QPointer<QWidget> control = {}; // of a group of fields the first one
    // Case folded, a line each:
    QString names = {}; // what it is called in any language, and in the file
    QString words = {}; // all that it may be looked for by: the names, and those of its page
};

/// Everything that the sheet's pages edit; makes those that have not been made yet.
std::vector<FoundField> FieldsOf(CDlgPropertySheet& sheet, CKavo0_hdDoc& document);
/// Those with every word of the text, the likeliest first.
std::vector<const FoundField*> Matching(const std::vector<FoundField>& fields, const QString& text);
/// Lets the user choose.
std::optional<FoundField> AskForField(const std::vector<FoundField>& fields, QWidget& parent);
