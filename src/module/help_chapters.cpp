#include "module/help_chapters.h"

#include "document/document.h"
#include "grid/bounds.h"
#include "module/sheet.h"
#include "pages/framework/page.h"
#include "pages/framework/page_help.h"
#include "problems/problem_texts.h"
#include "res/strings.h"

#include <QCoreApplication>
#include <map>

namespace {

struct HelpTexts
{
    Q_DECLARE_TR_FUNCTIONS(HelpTexts)
};

QString TextOf(const TextLine& line)
{
    return line ? PlainTitle(LoadLine(line.text, line.line)) : QString();
}

/// One entry of an integer's choices, or all of them.
QStringList ChoicesOf(const Field& field)
{
    QStringList choices;
    for (const QString& line :
         field.choices ? LoadLine(field.choices.text, field.choices.line).split(u'\n') : QStringList())
        choices << PlainTitle(line);
    return choices;
}

/// What the field holds in an object that nobody has changed.
QString DefaultText(const Field& field, const void* object, const CKsEditStyle& style)
{
    return Visit(
        field, object,
        Overloads{[&](double value) { return value == NotGiven ? QString() : style.FullText(value); },
                  [&](std::int32_t value) {
                      const QStringList choices = ChoicesOf(field);
                      return choices.isEmpty() ? QString::number(value) : choices.value(value - field.firstChoice);
                  },
                  [](bool value) { return value ? HelpTexts::tr("on") : HelpTexts::tr("off"); },
                  [](const std::string& value) { return QString::fromStdString(value); },
                  [](const HDDateTime&) { return HelpTexts::tr("now"); }, [](const auto&) { return QString(); }});
}

/// What a page edits, as rows of tables.
class Chapter
{
public:
    /// A group of an object's fields is not one of them: its elements are fields of a table of their own.
    void Add(const Field& field, const void* object, const QString& keyword)
    {
        const QString title = TextOf(field.title), meaning = TextOf(field.meaning),
                      choices = ChoicesOf(field).join(QStringLiteral(" / "));
        if (title.isEmpty() && meaning.isEmpty())
            return; // no page edits it
        CKsEditStyle style;
        style.SetEumUnitBaseGroup(field.unit);
        const QString range = field.kind == FieldKind::Integer ? choices : BoundsText(field.bounds, style);
        const QString own = QString::fromUtf8(field.name);
        const QString cells[] = {title.isEmpty() ? choices : title,
                                 meaning,
                                 style.UnitSymbol(),
                                 range,
                                 DefaultText(field, object, style),
                                 keyword.endsWith(u'/' + own) ? keyword : keyword + u'/' + own};
        m_rows += QStringLiteral("<tr>");
        for (const QString& cell : cells)
            m_rows += QStringLiteral("<td>%1</td>").arg(cell.toHtmlEscaped());
        m_rows += QStringLiteral("</tr>");
    }
    /// Puts a table of what was added below a heading.
    void End(const QString& heading)
    {
        if (m_rows.isEmpty())
            return;
        QString captions;
        for (const QString& caption : {HelpTexts::tr("Field"), HelpTexts::tr("Meaning"), HelpTexts::tr("Unit"),
                                       HelpTexts::tr("Range"), HelpTexts::tr("Default"), HelpTexts::tr("In the file")})
            captions += QStringLiteral("<th align=\"left\">%1</th>").arg(caption.toHtmlEscaped());
        m_html += QStringLiteral("<h3>%1</h3><table border=\"1\" cellspacing=\"0\" cellpadding=\"4\" "
                                 "width=\"100%\"><tr>%2</tr>%3</table>")
                      .arg(heading.toHtmlEscaped(), captions, m_rows);
        m_rows.clear();
    }
    const QString& Html() const { return m_html; }

private:
    QString m_html, m_rows;
};

class Chapters
{
public:
    Chapters(CDlgPropertySheet& sheet, CKavo0_hdDoc& document) : m_sheet(sheet), m_document(document) {}

    std::vector<KsHelpChapter> Make()
    {
        AddGlobals(HDGlobals());
        for (auto& [tab, chapter] : m_pages)
            chapter.End(HelpTexts::tr("Values of the whole file"));
        for (auto& [tab, lists] : m_tables)
            for (const auto& add : lists)
                add(m_pages[tab]);
        AddLists();
        std::vector<KsHelpChapter> chapters;
        for (int tab = 0; tab < m_sheet.PageCount(); ++tab)
            chapters.push_back({ChapterOf(tab), PlainTitle(m_sheet.tabText(tab)), m_pages[tab].Html() + Links()});
        chapters.push_back({QStringLiteral("keys"), HelpTexts::tr("Keys of fields and tables"), PageHelpText(true)});
        chapters.push_back({QStringLiteral("problems"), HelpTexts::tr("Problems and their codes"), Problems()});
        return chapters;
    }

private:
    void AddGlobals(const DeclaredSection& section)
    {
        for (const DeclaredKeyword& keyword : section.keywords)
            for (const Field& field : keyword.Fields()) {
                const int tab = m_sheet.TabWith({field.constAddress(&m_document.Parameters().Global)});
                const QString name = QString::fromUtf8(section.name) + u'/' + QString::fromUtf8(keyword.name);
                if (tab >= 0 && field.group)
                    m_tables[tab].push_back([&field, name](Chapter& chapter) {
                        HD_Global_Var one;
                        AddElements(chapter, field, &one, name);
                    });
                else if (tab >= 0)
                    m_pages[tab].Add(field, &m_global, name);
            }
        for (const DeclaredSection& inner : section.Sections())
            AddGlobals(inner);
    }

    /// The columns of a table that the object has, which nobody needs any more.
    static void AddElements(Chapter& chapter, const Field& group, void* object, const QString& name)
    {
        group.GroupIn(object).Resize(1);
        const auto elements = group.GroupIn(object);
        for (const Field& field : elements.Elements())
            chapter.Add(field, elements[0], name);
        chapter.End(HelpTexts::tr("Columns of a further table"));
    }

    void AddLists()
    {
        HD_Parameters fresh;
        fresh.EncroachList.Add(); // the one list that has to be made
        for (const ListEntry& entry : HDLists()) {
            CListSection& section = entry.list(m_document.Parameters());
            const void* const list = section.ListCount() > 0 ? &section.ListAt(0) : nullptr;
            const int tab = list ? m_sheet.TabWith({list, 0, 0, list})
                                 : m_sheet.TabWith({&m_document.Parameters().Global.Max_no_iter});
            if (tab >= 0)
                AddList(m_pages[tab], entry.list(fresh).ListAt(0), QString::fromUtf8(entry.section));
        }
    }

    static void AddList(Chapter& chapter, const CGenParamListBase& list, const QString& name)
    {
        const auto record = list.NewRecord();
        for (const FieldList fields : {LocationFields(), list.Fields()})
            for (const Field& field : fields)
                if (!field.group)
                    chapter.Add(field, record.get(), name);
        chapter.End(HelpTexts::tr("Columns of the values at locations"));
        for (const Field& field : list.Fields())
            if (field.group)
                AddElements(chapter, field, record.get(), name);
    }

    static QString Links()
    {
        return QStringLiteral("<p><a href=\"#keys\">%1</a> &nbsp; <a href=\"#problems\">%2</a></p>")
            .arg(HelpTexts::tr("Keys of fields and tables").toHtmlEscaped(),
                 HelpTexts::tr("Problems and their codes").toHtmlEscaped());
    }

    static QString Problems()
    {
        QString html = QStringLiteral("<table border=\"1\" cellspacing=\"0\" cellpadding=\"4\">");
        for (const Rule& rule : HDRules()) {
            const QString title = ProblemTexts::TitleOf(rule.id);
            html += QStringLiteral("<tr><td>%1</td><td>%2</td><td><b>%3</b><br>%4</td></tr>")
                        .arg(QString::fromLatin1(rule.code), ProblemTexts::NameOf(rule.severity).toHtmlEscaped(),
                             title.toHtmlEscaped(), ProblemTexts::ExplanationOf(rule.id).toHtmlEscaped());
        }
        return html + QStringLiteral("</table>");
    }

    CDlgPropertySheet& m_sheet;
    CKavo0_hdDoc& m_document;
    const HD_Global_Var m_global;
    std::map<int, Chapter> m_pages; // by tab
    std::map<int, std::vector<std::function<void(Chapter&)>>> m_tables;
};

} // namespace

QString ChapterOf(int tab)
{
    return QStringLiteral("page%1").arg(tab);
}

std::vector<KsHelpChapter> HelpChapters(CDlgPropertySheet& sheet, CKavo0_hdDoc& document)
{
    return Chapters(sheet, document).Make();
}
