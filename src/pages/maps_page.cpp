// "Maps": the result maps that the simulation writes, and the topography that they are made with.
#include "pages/framework/dialog_page.h"
#include "pages/framework/location_page.h"
#include "pages/page_table.h"
#include "ui_maps_page.h"

namespace {

constexpr int MapFileColumn = 7, DemFileColumn = 1;
constexpr std::int32_t DynamicType = 2;         // not the extreme over the simulation, but every so many steps
constexpr std::int32_t AdItem = 4, DemItem = 5; // of the items

FileKind GridFile(bool isWritten)
{
    return {.extension = QStringLiteral("kvt2"), .isWritten = isWritten};
}

const CMapsOutput& Map(const void* row)
{
    return *static_cast<const CMapsOutput*>(row);
}

bool IsNotDynamic(const void* row)
{
    return Map(row).Type != DynamicType;
}

template <typename T>
bool HasNoFile(const void* row)
{
    return static_cast<const T*>(row)->FileName.empty();
}

class CMapsPage : public CDialogPage<Ui::CMapsPage, CLocationPage>
{
public:
    explicit CMapsPage(CKavo0_hdDoc* document);
    void ButtonClicked(CGenGrid& grid, int row, int column) override;

private:
    void DeclareMaps();
};

CMapsPage::CMapsPage(CKavo0_hdDoc* document) : CDialogPage(document, nullptr)
{
    HDMapOutput& maps = Globals().MapOutput;
    Bindings().Add(m_ui.generate_1228, maps.GenerateOutput);
    Bindings().Add(m_ui.groundElevation_1239, maps.ApplyDemGroundElevation);
    Bindings().Add(m_ui.riverXsec_1237, maps.ApplyDemInRiverXsec);
    Bindings().Add(m_ui.geoDb_1240, maps.MapAreaGeoDb);
    Bindings().Add(m_ui.helpGrid_1241, maps.GeoDb, GridFile(false));

    const auto writesMaps = [&maps] { return maps.GenerateOutput; };
    const auto usesDem = [&maps] { return maps.GenerateOutput && maps.ApplyDemGroundElevation; };
    Bindings().ShowWhen(writesMaps, {m_ui.maps_1226, m_ui.status_1229});
    Bindings().EnableWhen(writesMaps, {m_ui.groundElevation_1239});
    Bindings().EnableWhen(usesDem, {m_ui.riverXsec_1237, m_ui.geoDb_1240});
    Bindings().ShowWhen(usesDem, {m_ui.dem_1227});
    Bindings().EnableWhen([usesDem, &maps] { return usesDem() && maps.MapAreaGeoDb; }, {m_ui.helpGrid_1241});

    m_ui.maps_1226->SetLineChoice(LineChoice::CurrentLine);
    m_ui.dem_1227->SetLineChoice(LineChoice::CurrentLine);
    DeclareMaps();
    ItemsGrid(m_ui.dem_1227, maps.DemInputFiles)
        .Value(&CMapsInput::FileName, {.width = 150})
        .Button({.header = LineOf(Str::DemColumns, 1), .width = 20})
        .Value(&CMapsInput::ItemNo)
        .Value(&CMapsInput::Order);
    LeaveOut({{m_ui.maps_1226, &HasNoFile<CMapsOutput>}, {m_ui.dem_1227, &HasNoFile<CMapsInput>}}, m_ui.status_1229,
             Str::RowsWithoutFile, Str::DroppedFile, Str::DroppedFiles);
}

void CMapsPage::DeclareMaps()
{
    const auto isDem = [](const void* row) { return Map(row).Item == DemItem; };
    using M = CMapsOutput;
    GridColumns columns = ItemsGrid(m_ui.maps_1226, Globals().MapOutput.MapOutputFiles);
    for (double M::*number : {&M::XOrigin, &M::YOrigin, &M::Rotation, &M::GridSize})
        columns.Value(number, {.width = 50});
    for (std::int32_t M::*cells : {&M::JCells, &M::KCells})
        columns.Value(cells, {.width = 50});
    columns.Value(&M::FileName)
        .Button({.header = LineOf(Str::MapColumns, 7), .width = 20})
        .Value(&M::Type, {.locked = isDem})
        .Value(&M::Item)
        .Value(&M::ComponentNo, {.width = 50, .locked = [](const void* row) { return Map(row).Item != AdItem; }})
        .Value(&M::StoringFrequency,
               {.width = 50, .locked = [isDem](const void* row) { return IsNotDynamic(row) || isDem(row); }})
        .Value(&M::DefaultPeriod, {.width = 20, .locked = IsNotDynamic})
        .Value(&M::StartTime, {.width = 110, .locked = IsNotDynamic})
        .Value(&M::EndTime, {.width = 110, .locked = IsNotDynamic});
}

void CMapsPage::ButtonClicked(CGenGrid& grid, int row, int /*column*/)
{
    const bool isMap = &grid == m_ui.maps_1226;
    BrowseInto(grid, row, isMap ? MapFileColumn : DemFileColumn, GridFile(isMap));
}

} // namespace

const PageMaker MakeMapsPage = &MakePage<CMapsPage>;
