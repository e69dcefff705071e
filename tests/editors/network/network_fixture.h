// A small network, a shell that answers its requests, and a document of HD parameters that only looks like one.
#pragma once

#include "editors/editor_fixture.h"
#include "editors/network/module.h"
#include "editors/network/network_file.h"
#include "editors/network/view.h"
#include "ks/fc/exports.h"
#include "ks/fc/file_dialog.h"
#include "ks/fc/hd_messages.h"

/// MAIN goes 3000 m to the east and 4000 m to the north, its chainages from 1000 to 8000; SIDE joins it from the south,
/// digitised from its mouth up.
inline constexpr const char* SmallNetwork = R"([KVR_NETWORK]
  Survey = "2019", 3   // unknown to the editor
  [Branch]
    Name = "MAIN"
    Chainage = 1000, 8000
    FlowsDownstream = true
    Owner = <C:\\data\\owner.txt>
    [Line]
      Vertex = 0, 0
      Vertex = 3000, 0
      Vertex = 3000, 4000
    [/Line]
    [Channel]
      DATA = 2000, 400, 30
      DATA = 4000, nan, 50
      DATA = 6000, 800, nan
    [/Channel]
    [Bridges]
      At = 2500, "RAILWAY"
      [Piers]
        Count = 2
      [/Piers]
    [/Bridges]
  [/Branch]
  [Branch]
    Name = "SIDE"
    Chainage = 500, 0
    FlowsDownstream = true
    [Line]
      Vertex = 3000, 0
      Vertex = 3000, -1000
    [/Line]
    [Channel]
    [/Channel]
  [/Branch]
[/KVR_NETWORK]
[OTHER_PROGRAM]
  Colour = 7
[/OTHER_PROGRAM]
)";

class FakeHDDoc : public CKsDoc
{
public:
    BOOL OnSaveDocument(const CString&) override { return false; }
};

class FakeHDView : public CView
{
public:
    LRESULT WindowProc(unsigned message, WPARAM request, LPARAM lParam) override
    {
        const auto* package = reinterpret_cast<const CKSComm_Package*>(lParam);
        const auto* item = dynamic_cast<const CKvr_CBE_ModelDataItem*>(package->objects->front().get());
        requests << QString("%1 %2 %3 %4 from %5")
                        .arg(message == KsMessage::BetweenEditors() ? int(request) : -1)
                        .arg(item->branch)
                        .arg(item->chainage)
                        .arg(item->type)
                        .arg(package->view ? package->view->objectName() : QString("nobody"));
        return 0;
    }
    QStringList requests;
};

class NetworkTest : public EditorTest
{
protected:
    NetworkTest()
    {
        hdDoc.SetPathName(folder.filePath("river.HDKV"));
        hdDoc.AddView(&hdView);
        current = this;
        KsAddExports([](const char* name) -> QFunctionPointer {
            if (qstrcmp(name, "KvrMSGGetData") == 0)
                return reinterpret_cast<QFunctionPointer>(&GetData);
            return qstrcmp(name, "KvrMSGSelectData") == 0 ? reinterpret_cast<QFunctionPointer>(&SelectData) : nullptr;
        });
    }
    ~NetworkTest() override
    {
        KsClearExports();
        frame.reset();
        KsSetFileDialogHandler({});
    }

    LRESULT WindowProc(unsigned message, WPARAM request, LPARAM lParam) override
    {
        auto* package = reinterpret_cast<CKSComm_Package*>(lParam);
        log << QString("%1 %2").arg(message == KsMessage::SwitchBoard() ? "shell" : "others").arg(request);
        if (message != KsMessage::SwitchBoard())
            return 0;
        if (request == KsRequest::ProjectViews && package->objects && hdOpen) {
            auto item = std::make_unique<CKvrCBEView>();
            item->view = &hdView;
            package->objects->push_back(std::move(item));
        }
        return request == KsRequest::JoinProject ? project : 0;
    }

    static QString ReadNetwork(const QString& path, CNetwork& network)
    {
        return ReadBy(path, [&](tqlHandle file, LoadReport& report) { network = LoadNetwork(file, report); });
    }
    static QString WriteNetwork(const QString& path, const CNetwork& network)
    {
        const auto saved = SaveDeclaredFile(path.toStdString(), DeclaredNetworkFile(), &network);
        return saved ? QString() : QString::fromStdString(saved.error().message);
    }
    /// Opens the small network in a window.
    CNetworkView* Open(const QByteArray& text = SmallNetwork)
    {
        auto* view =
            static_cast<CNetworkView*>(OpenIn({900, 800}, NetworkEditor().CreateTemplate(), Write("river.kvnw", text)));
        if (view)
            view->Map()->setFocus();
        return view;
    }
    static void Click(CNetworkMap* map, const std::optional<QPointF>& at, const QPoint& off = {})
    {
        ASSERT_TRUE(at.has_value());
        QTest::mouseClick(map, Qt::LeftButton, Qt::NoModifier, at->toPoint() + off);
    }
    QPointF PointOf(CNetworkMap* map, const char* branch, double chainage) const
    {
        return map->WindowPoint({branch, chainage}).value_or(QPointF(-1, -1));
    }

    static CObList* GetData(const CString& path, CKsDoc* document)
    {
        current->log << QString("get data %1").arg(document == &current->hdDoc && path == document->GetPathName());
        auto list = std::make_unique<CObList>();
        list->push_back(std::make_unique<CKvrCBEText>()); // not what was asked for
        for (const CMapLocation& each : current->hdLocations) {
            auto item = std::make_unique<CKvr_CBE_ModelDataItem>();
            item->branch = each.branch;
            item->chainage = each.chainage;
            item->type = each.kind;
            list->push_back(std::move(item));
        }
        return list.release();
    }
    static void SelectData(const CString&, CView* view, CObList* items)
    {
        const auto* item = dynamic_cast<const CKvr_CBE_ModelDataItem*>(items->front().get());
        current->log << QString("select %1 %2 %3").arg(view == &current->hdView).arg(item->branch).arg(item->chainage);
    }

    inline static NetworkTest* current = nullptr;
    bool hdOpen = true;
    std::vector<CMapLocation> hdLocations{
        {"MAIN", 2000, HDInitialData, {}}, {"MAIN", 5000, HDBedData, {}},
        {"MAIN", 9000, HDBedData, {}},                                         // behind the end
        {"LOST", 100, HDWindData, {}},     {"SIDE", 250, HDDataTypeCount, {}}, // no such kind
        {"", 100, HDInitialData, {}},                                          // lines that are not complete
        {"MAIN", 1e10, HDInitialData, {}}};
    FakeHDDoc hdDoc;
    FakeHDView hdView; // goes before its document
};
