// "Time Series Output": which results go into time series files, of which grid points, in which form.
#include "pages/framework/date_time_edit.h"
#include "pages/framework/dialog_page.h"
#include "pages/framework/location_page.h"
#include "pages/page_table.h"
#include "ui_text_output_page.h"

namespace {

constexpr int FileFormatColumn = 1, FileNameColumn = 3;

class CTextOutputPage : public CDialogPage<Ui::CTextOutputPage, CLocationPage>
{
public:
    explicit CTextOutputPage(CKavo0_hdDoc* document);
    void ButtonClicked(CGenGrid& grid, int row, int column) override;
};

CTextOutputPage::CTextOutputPage(CKavo0_hdDoc* document) : CDialogPage(document, &HD_Parameters::OutputGridPoints)
{
    HDTextOutput& output = Globals().TextOutput;
    Bindings().Add(m_ui.generate_1205, output.GenerateOutput);
    Bindings().Add(m_ui.delimiter_1208, output.Delimiter);
    Bindings().Add(m_ui.width_1209, output.ColumnWidth);
    bool* summary = output.SummaryInfo;
    for (QCheckBox* box : {m_ui.minimum_1212, m_ui.maximum_1213, m_ui.timeOfMinimum_1214, m_ui.timeOfMaximum_1215})
        Bindings().Add(box, *summary++);
    Bindings().Add(m_ui.limited_1221, output.LimitedPeriod);
    Bindings().Add(m_ui.start_1223, output.LimitedPeriodStart);
    Bindings().Add(m_ui.end_1225, output.LimitedPeriodEnd);
    Bindings().EnableWhen([&output] { return output.LimitedPeriod; }, {m_ui.start_1223, m_ui.end_1225});
    Bindings().Add({m_ui.all_1218, m_ui.only_1219, m_ui.except_1220}, output.GridPointOutputType);

    for (CGenGrid* grid : {m_ui.grid_1217, m_ui.items_1216, m_ui.files_1226})
        grid->SetLineChoice(LineChoice::CurrentLine);
    Grid(m_ui.grid_1217)
        .BranchName({.width = 110})
        .Chainage({.header = LineOf(Str::UpstreamChainage)})
        .Value(&HDOutputGridPoint::PointValue, {.emptyIsNotGiven = true});
    ItemsGrid(m_ui.items_1216, output.OutputItems)
        .Value(&CTextOutItem::Item, {.width = 200})
        .Value(&CTextOutItem::UserName, {.width = 110})
        .Value(&CTextOutItem::Decimals, {.width = 110});
    ItemsGrid(m_ui.files_1226, output.OutputFiles)
        .Value(&CTextAutoFile::Format, {.width = 185})
        .Value(&CTextAutoFile::AutoName, {.width = 35})
        .Value(&CTextAutoFile::FileName, {.width = 185})
        .Button({.header = LineOf(Str::OutputFileColumns, 3), .width = 20});
    // What the empty tables show is what a new file gets.
    for (const CGenGrid* grid : {m_ui.items_1216, m_ui.files_1226})
        AtSave({.rows = grid->Model()->Rows(), .writesFirstRow = true});
}

void CTextOutputPage::ButtonClicked(CGenGrid& grid, int row, int /*column*/)
{
    const bool isBridge = grid.TextAt(row, FileFormatColumn) == LineOf(Str::OutputFormats, 0)();
    BrowseInto(grid, row, FileNameColumn,
               {.extension = isBridge ? QStringLiteral("kvt0") : QStringLiteral("txt"), .isWritten = true});
}

} // namespace

const PageMaker MakeTextOutputPage = &MakePage<CTextOutputPage>;
