#include "module/find_field.h"

#include "document/document.h"
#include "grid/gen_grid.h"
#include "ks/units/edit_fields.h"
#include "module/sheet.h"
#include "pages/framework/location_page.h"
#include "pages/page_table.h"
#include "res/strings.h"

#include <QAbstractButton>
#include <QDialog>
#include <QDialogButtonBox>
#include <QGroupBox>
#include <QHeaderView>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QTreeWidget>
#include <QVBoxLayout>
#include <algorithm>
#include <memory>

namespace {

/// A title as one reads it: without the mark of a key to press.
QString Plain(const QString& title)
{
    return QString::fromStdString(PlainText(title.toStdString()));
}

class CFieldIndex
{
public:
    CFieldIndex(CDlgPropertySheet& sheet, CKavo0_hdDoc& document) : m_sheet(sheet), m_document(document) {}

    std::vector<FoundField> Make()
    {
        for (int tab = 0; tab < m_sheet.PageCount(); ++tab)
            Add({tab, {}, Plain(m_sheet.tabText(tab)), {}, {}, {}}, {m_sheet.CaptionOf(tab)},
                TextsOn(*m_sheet.PageAt(tab)));
        for (const DeclaredSection& section : HDGlobals().Sections())
            for (const DeclaredKeyword& keyword : section.keywords)
                for (const Field& field : keyword.Fields())
                    AddGlobal(keyword, field);
        for (const ListEntry& entry : HDLists()) {
            CListSection& section = entry.list(m_document.Parameters());
            if (section.ListCount() > 0)
                AddList(entry.section, section.ListAt(0));
        }
        return std::move(m_fields);
    }

private:
    int TabOf(const ChangePlace& place) const
    {
        int tab = 0;
        while (tab < m_sheet.PageCount() && !m_sheet.PageAt(tab)->Shows(place))
            ++tab;
        return tab;
    }

    /// What stands on a page, in the user's language.
    static QString TextsOn(const QWidget& page)
    {
        QStringList texts;
        for (const auto* label : page.findChildren<QLabel*>())
            texts << Plain(label->text());
        for (const auto* button : page.findChildren<QAbstractButton*>())
            texts << Plain(button->text());
        for (const auto* group : page.findChildren<QGroupBox*>())
            texts << Plain(group->title());
        return texts.join(u'\n');
    }

    void Add(FoundField field, const TextLine& title, const QString& names, const TextLine& choices = {})
    {
        field.page = Plain(m_sheet.tabText(field.tab));
        QStringList words{field.title, names, field.keyword, field.page};
        for (const TextLine& line : {title, choices, TextLine(m_sheet.CaptionOf(field.tab))})
            for (const QString& text : line ? InAllLanguages(line) : QStringList())
                words << Plain(text);
        words.removeDuplicates();
        field.words = words.join(u'\n').toCaseFolded();
        m_fields.push_back(std::move(field));
    }

    void AddGlobal(const DeclaredKeyword& keyword, const Field& field)
    {
        const ChangePlace place{field.constAddress(&m_document.Parameters().Global)};
        const int tab = TabOf(place);
        if (tab == m_sheet.PageCount())
            return; // no page edits it
        const QString name = QString::fromUtf8(field.name);
        const QString title =
            field.title     ? Plain(LoadLine(field.title.text, field.title.line))
            : field.choices ? LoadLine(field.choices.text, field.choices.line).replace(u'\n', QStringLiteral(" / "))
                            : name;
        Add({tab, place, title, {}, QString::fromUtf8(keyword.name), {}}, field.title, name, field.choices);
    }

    void AddList(const char* section, CGenList& list)
    {
        const ChangePlace place{&list, 0, 0, &list};
        const int tab = TabOf(place);
        if (tab == m_sheet.PageCount())
            return;
        Add({tab, place, Plain(m_sheet.tabText(tab)), {}, QString::fromUtf8(section), {}}, {}, {});
        const CGenGrid* grid = m_sheet.PageAt(tab)->GetGrid();
        for (const Field& field : list.Fields()) {
            if (!field.title || !grid)
                continue;
            const auto& columns = grid->Model()->Columns();
            const auto column = std::ranges::find(columns, field.name, &ColumnSpec::name);
            if (column == columns.end())
                continue;
            const QString title = column->header();
            const ChangePlace cell{&list, 1, int(column - columns.begin()) + 1, &list, 1};
            Add({tab, cell, Plain(title), {}, QString::fromUtf8(section), {}}, field.title,
                QString::fromUtf8(field.name), field.choices);
        }
    }

    CDlgPropertySheet& m_sheet;
    CKavo0_hdDoc& m_document;
    std::vector<FoundField> m_fields;
};

class CFindFieldDlg : public QDialog
{
public:
    CFindFieldDlg(const std::vector<FoundField>& fields, QWidget& parent) : QDialog(&parent), m_fields(fields)
    {
        setWindowTitle(LoadString(Str::FindFieldTitle));
        auto* layout = new QVBoxLayout(this);
        m_text = new QLineEdit;
        m_text->setAccessibleName(LoadString(Str::FindFieldPrompt));
        KsShowHint(*m_text, LoadString(Str::FindFieldPrompt));
        m_text->installEventFilter(this);
        m_list = new QTreeWidget;
        m_list->setAccessibleName(LoadString(Str::FindFieldResults));
        m_list->setHeaderLabels(LoadString(Str::FindFieldColumns).split(u'\n'));
        m_list->setRootIsDecorated(false);
        m_list->setUniformRowHeights(true);
        m_list->header()->setStretchLastSection(true);
        auto* buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
        m_ok = buttons->button(QDialogButtonBox::Ok);
        layout->addWidget(m_text);
        layout->addWidget(m_list);
        m_none = new QLabel(LoadString(Str::FindFieldNone));
        m_none->setWordWrap(true);
        layout->addWidget(m_none);
        layout->addWidget(buttons);
        connect(buttons, &QDialogButtonBox::accepted, this, &QDialog::accept);
        connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
        connect(m_text, &QLineEdit::textChanged, this, [this] { Show(); });
        connect(m_list, &QTreeWidget::itemActivated, this, &QDialog::accept);
        resize(620, 420);
        Show();
        m_list->setColumnWidth(0, 270);
        m_list->setColumnWidth(1, 170);
    }

    const FoundField* Chosen() const
    {
        const int row = m_list->indexOfTopLevelItem(m_list->currentItem());
        return row < 0 ? nullptr : m_matching[std::size_t(row)];
    }

protected:
    /// Who types goes through the list without leaving the text.
    bool eventFilter(QObject* object, QEvent* event) override
    {
        if (object != m_text || event->type() != QEvent::KeyPress)
            return QDialog::eventFilter(object, event);
        const int key = static_cast<QKeyEvent*>(event)->key();
        if (key != Qt::Key_Up && key != Qt::Key_Down && key != Qt::Key_PageUp && key != Qt::Key_PageDown)
            return false;
        QCoreApplication::sendEvent(m_list, event);
        return true;
    }

private:
    void Show()
    {
        m_matching = Matching(m_fields, m_text->text());
        m_list->clear();
        for (const FoundField* field : m_matching)
            m_list->addTopLevelItem(new QTreeWidgetItem({field->title, field->page, field->keyword}));
        m_list->setCurrentItem(m_list->topLevelItem(0));
        m_ok->setEnabled(!m_matching.empty());
        m_none->setVisible(m_matching.empty());
    }

    const std::vector<FoundField>& m_fields;
    std::vector<const FoundField*> m_matching;
    QLineEdit* m_text;
    QTreeWidget* m_list;
    QLabel* m_none; // says that nothing is found
    QPushButton* m_ok;
};

/// The lower the likelier that it is meant.
int Rank(const FoundField& field, const QString& text)
{
    const QString title = field.title.toCaseFolded(), keyword = field.keyword.toCaseFolded();
    if (title == text || keyword == text)
        return 0;
    if (title.startsWith(text) || keyword.startsWith(text))
        return 1;
    return title.contains(text) || keyword.contains(text) ? 2 : 3;
}

} // namespace

std::vector<FoundField> FieldsOf(CDlgPropertySheet& sheet, CKavo0_hdDoc& document)
{
    return CFieldIndex(sheet, document).Make();
}

std::vector<const FoundField*> Matching(const std::vector<FoundField>& fields, const QString& text)
{
    const QString wanted = text.simplified().toCaseFolded();
    const QStringList words = wanted.split(u' ', Qt::SkipEmptyParts);
    std::vector<const FoundField*> matching;
    for (const FoundField& field : fields)
        if (std::ranges::all_of(words, [&](const QString& word) { return field.words.contains(word); }))
            matching.push_back(&field);
    if (!wanted.isEmpty())
        std::ranges::stable_sort(matching, {}, [&](const FoundField* field) { return Rank(*field, wanted); });
    return matching;
}

std::optional<FoundField> AskForField(const std::vector<FoundField>& fields, QWidget& parent)
{
    CFindFieldDlg dialog(fields, parent);
    if (dialog.exec() != QDialog::Accepted || !dialog.Chosen())
        return std::nullopt;
    return *dialog.Chosen();
}
