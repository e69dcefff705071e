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
#include <map>
#include <memory>

namespace {

class CFieldIndex
{
public:
    CFieldIndex(CDlgPropertySheet& sheet, CKavo0_hdDoc& document) : m_sheet(sheet), m_document(document) {}

    std::vector<FoundField> Make()
    {
        for (int tab = 0; tab < m_sheet.PageCount(); ++tab)
            Add({.tab = tab, .title = PlainTitle(m_sheet.tabText(tab))}, NamesOf(m_sheet.CaptionOf(tab)),
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
        for (int tab = 0; tab < m_sheet.PageCount(); ++tab)
            for (const CGenGrid* grid : m_sheet.PageAt(tab)->findChildren<CGenGrid*>())
                AddTable(tab, *grid);
        AddGroups();
        return std::move(m_fields);
    }

private:
    struct ListOf
    {
        QString keyword;
        const CGenList* list = nullptr;
    };

    /// What stands on a page, in the user's language.
    static QString TextsOn(const QWidget& page)
    {
        QStringList texts;
        for (const auto* label : page.findChildren<QLabel*>())
            texts << PlainTitle(label->text());
        for (const auto* button : page.findChildren<QAbstractButton*>())
            texts << PlainTitle(button->text());
        for (const auto* group : page.findChildren<QGroupBox*>())
            texts << PlainTitle(group->title());
        return texts.join(u'\n');
    }

    /// Line by line.
    static QStringList NamesOf(const TextLine& line)
    {
        QStringList names;
        for (const QString& text : line ? InAllLanguages(line) : QStringList())
            names << PlainTitle(text);
        return names;
    }

    /// `further` is what it can be looked for by, too.
    void Add(FoundField field, QStringList names, const QString& further = {})
    {
        field.page = PlainTitle(m_sheet.tabText(field.tab));
        names << field.title << field.keyword;
        names.removeAll(QString());
        names.removeDuplicates();
        field.names = names.join(u'\n').toCaseFolded();
        const QStringList page = NamesOf(m_sheet.CaptionOf(field.tab));
        field.words = (names + page << field.page << further).join(u'\n').toCaseFolded();
        m_fields.push_back(std::move(field));
    }

    void AddGlobal(const DeclaredKeyword& keyword, const Field& field)
    {
        const ChangePlace place{field.constAddress(&m_document.Parameters().Global)};
        const int tab = m_sheet.TabWith(place);
        if (tab < 0)
            return; // no page edits it
        const QString name = QString::fromUtf8(field.name);
        QString title = name;
        if (field.title)
            title = PlainTitle(LoadLine(field.title.text, field.title.line));
        else if (field.choices)
            title = Choices(LoadLine(field.choices.text, field.choices.line)).join(QStringLiteral(" / "));
        QStringList names = NamesOf(field.title) << name;
        for (const QString& choices : field.choices ? InAllLanguages(field.choices) : QStringList())
            names << Choices(choices);
        Add({.tab = tab, .place = place, .title = title, .keyword = QString::fromUtf8(keyword.name)}, names);
    }

    static QStringList Choices(const QString& lines)
    {
        QStringList choices;
        for (const QString& line : lines.split(u'\n'))
            choices << PlainTitle(line);
        return choices;
    }

    void AddList(const char* section, CGenList& list)
    {
        const ChangePlace place{&list, 0, 0, &list};
        const int tab = m_sheet.TabWith(place);
        if (tab < 0)
            return;
        const QString keyword = QString::fromUtf8(section);
        Add({.tab = tab, .place = place, .title = PlainTitle(m_sheet.tabText(tab)), .keyword = keyword}, {});
        if (const CGenGrid* grid = m_sheet.PageAt(tab)->GetGrid())
            m_lists.emplace(grid, ListOf{keyword, &list});
    }

    /// Its columns; those of a table that a list keeps are in its section of the file.
    void AddTable(int tab, const CGenGrid& grid)
    {
        const IRowSource* const rows = grid.Model()->Rows().get();
        const auto known = m_lists.find(&grid);
        const ListOf list = known == m_lists.end() ? ListOf() : known->second;
        const auto& columns = grid.Model()->Columns();
        for (std::size_t column = 0; column < columns.size(); ++column) {
            const ColumnSpec& spec = columns[column];
            // Branch and chainage of every list are called the same; of these only those in sight are meant.
            const bool isPlace = list.list && spec.namesLine && tab != m_sheet.currentIndex() && HasUsualName(spec);
            if (isPlace || spec.Kind() == CellKind::Button || spec.header().isEmpty())
                continue;
            FoundField field{.tab = tab, .title = PlainTitle(spec.header()).simplified(), .keyword = list.keyword};
            if (rows) // without, there is no line yet that would have the table
                field.place = {rows->Data(), 1, int(column) + 1, rows->List() ? rows->List() : rows->Data()};
            QStringList choices = spec.choices.entries ? spec.choices.entries() : QStringList();
            if (list.list)
                for (const Field& declared : list.list->Fields())
                    if (declared.choices && declared.name == spec.name)
                        choices += InAllLanguages(declared.choices);
            Add(field, spec.names ? spec.names() : QStringList(), choices.join(u'\n'));
            TellApart(grid);
        }
    }

    static bool HasUsualName(const ColumnSpec& column)
    {
        const QString title = column.header().simplified();
        return title == LoadString(Str::RiverName).simplified() || title == LoadString(Str::Chainage).simplified();
    }

    /// What was added last, if another table or field of the page calls something the same.
    void TellApart(const CGenGrid& grid)
    {
        FoundField& last = m_fields.back();
        const auto isSame = [&last](const FoundField& each) {
            return &each != &last && each.tab == last.tab && each.title == last.title;
        };
        if (std::ranges::any_of(m_fields, isSame) && !grid.accessibleName().isEmpty())
            last.title += QStringLiteral(" - ") + grid.accessibleName();
    }

    /// The headings of groups of fields, but for those that most pages have.
    void AddGroups()
    {
        std::map<QString, int> count;
        for (int tab = 0; tab < m_sheet.PageCount(); ++tab)
            for (const auto* group : m_sheet.PageAt(tab)->findChildren<QGroupBox*>())
                ++count[group->title()];
        for (int tab = 0; tab < m_sheet.PageCount(); ++tab)
            for (auto* group : m_sheet.PageAt(tab)->findChildren<QGroupBox*>())
                if (QWidget* first = FirstIn(*group); first && !group->title().isEmpty() && count[group->title()] == 1)
                    Add({.tab = tab, .title = PlainTitle(group->title()), .control = first}, {});
    }

    static QWidget* FirstIn(QGroupBox& group)
    {
        for (QWidget* next = group.nextInFocusChain(); next && next != &group; next = next->nextInFocusChain())
            if (group.isAncestorOf(next) && next->focusPolicy() & Qt::TabFocus && next->isEnabledTo(&group))
                return next;
        return nullptr;
    }

    CDlgPropertySheet& m_sheet;
    CKavo0_hdDoc& m_document;
    std::vector<FoundField> m_fields;
    std::map<const CGenGrid*, ListOf> m_lists; // of the tables of lists
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
    int rank = 3;
    for (const QString& name : field.names.split(u'\n'))
        rank = std::min(rank, name == text ? 0 : name.startsWith(text) ? 1 : name.contains(text) ? 2 : 3);
    return rank;
}

} // namespace

std::vector<FoundField> FieldsOf(CDlgPropertySheet& sheet, CKavo0_hdDoc& document)
{
    return CFieldIndex(sheet, document).Make();
}

std::vector<const FoundField*> Matching(const std::vector<FoundField>& fields, const QString& text)
{
    const QString wanted = text.normalized(QString::NormalizationForm_KC).simplified().toCaseFolded();
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
