// "User Def. Marks": titles of water level marks, and a level a title at locations.
#include "pages/framework/dialog_page.h"
#include "pages/framework/location_page.h"
#include "pages/mark_title_rows.h"
#include "pages/page_table.h"
#include "ui_wl_mark_page.h"

#include <algorithm>

namespace {

constexpr int LocationColumns = 2; // the columns of levels follow

CellAccess TitleAccess()
{
    return {[](const void* row) -> CellValue { return static_cast<const MarkTitle*>(row)->Title(); },
            [](void* row, const CellValue& value) {
                static_cast<MarkTitle*>(row)->SetTitle(std::get<std::string>(value));
            }};
}

CellAccess InterpolateAccess()
{
    return {
        [](const void* row) -> CellValue { return std::int32_t(static_cast<const MarkTitle*>(row)->Interpolate()); },
        [](void* row, const CellValue& value) {
            static_cast<MarkTitle*>(row)->SetInterpolate(std::get<std::int32_t>(value) != 0);
        },
        [](const void* object) {
            // The list of flags may have ended before this one.
            const auto* title = static_cast<const MarkTitle*>(object);
            const std::size_t flags = title->globals ? title->globals->MarkInterpolate.size() : 0;
            return [flags, on = title->Interpolate()](void* row) {
                auto* changed = static_cast<MarkTitle*>(row);
                changed->SetInterpolate(on);
                if (changed->globals)
                    changed->globals->MarkInterpolate.resize(flags);
            };
        }};
}

bool IsUntitled(const void* row)
{
    return static_cast<const MarkTitle*>(row)->Title().empty();
}

const HDWLMark& Mark(const void* row)
{
    return static_cast<const HDWLMark&>(*static_cast<const HD_RiverPos*>(row));
}

HDWLMark& Mark(void* row)
{
    return static_cast<HDWLMark&>(*static_cast<HD_RiverPos*>(row));
}

/// The level under one title. A record may hold fewer levels than there are titles; a level that is given lengthens it.
CellAccess LevelAccess(std::size_t title)
{
    return {[title](const void* row) -> CellValue {
                const auto& levels = Mark(row).MarkLevels;
                return title < levels.size() ? CellValue(levels[title]) : CellValue();
            },
            [title](void* row, const CellValue& value) {
                auto& levels = Mark(row).MarkLevels;
                if (title >= levels.size())
                    levels.resize(title + 1, NotGiven);
                levels[title] = std::get<double>(value);
            },
            [title](const void* object) {
                const auto& levels = Mark(object).MarkLevels;
                return [title, count = levels.size(),
                        level = title < levels.size() ? levels[title] : NotGiven](void* row) {
                    auto& changed = Mark(row).MarkLevels;
                    changed[title] = level;
                    changed.resize(count);
                };
            }};
}

class CWLMarkPage : public CDialogPage<Ui::CWLMarkPage, CLocationPage>
{
public:
    explicit CWLMarkPage(CKavo0_hdDoc* document);
    void AppendLine() override;
    void DeleteLines() override;

private:
    void ShowLevelColumns();
};

CWLMarkPage::CWLMarkPage(CKavo0_hdDoc* document) : CDialogPage(document, &HD_Parameters::WaterLevelMarkList)
{
    m_ui.grid_1074->SetLineChoice(LineChoice::CurrentLine);
    Grid(m_ui.grid_1074).BranchName({.width = 71}).Chainage({.width = 71});
    const auto element = [this](const auto& group) -> const Field& {
        return Bindings().Declaration(&group).group->elements()[0];
    };
    RowsGrid(m_ui.titles_1075, MakeMarkTitleRows(*document))
        .Value(TitleAccess(), element(Globals().MarkTitles), {.width = 300, .upperCase = true})
        .Value(InterpolateAccess(), element(Globals().MarkInterpolate), {.width = 50});
    Bindings().Always([this] { ShowLevelColumns(); });
    // With an untitled column go its levels.
    LeaveOut({{m_ui.titles_1075, &IsUntitled}}, m_ui.status_1076, Str::MarksWithoutTitle, Str::DroppedTitle,
             Str::DroppedTitles);
}

/// One column of levels a title.
void CWLMarkPage::ShowLevelColumns()
{
    const std::vector<std::string>& titles = Globals().MarkTitles;
    const std::size_t shown = std::max<std::size_t>(titles.size(), 1); // the row that stands for no titles, too
    CGridModel& model = *GetGrid()->Model();
    model.RemoveColumnsFrom(LocationColumns + int(shown));
    const Field& level = HDWLMark::DeclaredFields()[0].group->elements()[0];
    GridColumns columns(*GetGrid());
    for (auto title = std::size_t(model.columnCount() - LocationColumns); title < shown; ++title)
        columns.Value(
            LevelAccess(title), level,
            {.header = [&titles,
                        title] { return title < titles.size() ? QString::fromStdString(titles[title]) : QString(); },
             .width = 62,
             .emptyIsNotGiven = true});
}

void CWLMarkPage::AppendLine()
{
    StoreToDocument(); // what is typed below a title stays below it
    CLocationPage::AppendLine();
}

void CWLMarkPage::DeleteLines()
{
    StoreToDocument();
    const CGenGrid* grid = LinesGrid();
    if (grid == m_ui.titles_1075 && grid->RowCount() <= 1)
        return; // there is always a title to name
    CLocationPage::DeleteLines();
}

} // namespace

const PageMaker MakeWLMarkPage = &MakePage<CWLMarkPage>;
