// A few cross sections, and a shell that answers their view's requests.
#pragma once

#include "editors/cross_sections/module.h"
#include "editors/cross_sections/section_file.h"
#include "editors/cross_sections/view.h"
#include "editors/editor_fixture.h"

#include <cmath>
#include <functional>

/// Not sorted. MAIN has a trapezoid 10 m deep and wide at its bottom, two surveys of one place, and a section without
/// anything.
inline constexpr const char* SmallSections = R"([KVR_CROSS_SECTIONS]
  Datum = "NHN", 3   // unknown to the editor
  [CrossSection]
    Branch = "MAIN"
    TopoID = "2019"
    Chainage = 2500.5
    Radius = 400
    Width = 20
    Surveyor = <C:\\data\\owner.txt>
    [Profile]
      Point = 0, 110
      Point = 10, 100
      Point = 20, 100
      Point = 30, 110
      Scale = 2
    [/Profile]
    [Roughness]
      Zone = 1, "reed"
    [/Roughness]
  [/CrossSection]
  [CrossSection]
    Branch = "SIDE"
    Chainage = 300
    Width = 7
  [/CrossSection]
  [CrossSection]
    Branch = "MAIN"
    TopoID = "2021"
    Chainage = 2500.5
    Radius = 450
    Width = 25
  [/CrossSection]
  [CrossSection]
    Branch = "MAIN"
    TopoID = "2019"
    Chainage = 1000
    Radius = nan
    [Profile]
      Point = -5, 3
      Point = 5, 3
    [/Profile]
  [/CrossSection]
[/KVR_CROSS_SECTIONS]
[OTHER_PROGRAM]
  Colour = 7
[/OTHER_PROGRAM]
)";
// As they stand in the tables.
enum SmallRow
{
    Main1000,
    Main2500,
    Main2500Later,
    Side300,
    SmallRows
};

class CrossSectionTest : public EditorTest
{
protected:
    ~CrossSectionTest() override { frame.reset(); }

    LRESULT WindowProc(unsigned message, WPARAM request, LPARAM lParam) override
    {
        auto* package = reinterpret_cast<CKSComm_Package*>(lParam);
        const bool shell = message == KsMessage::SwitchBoard();
        if (!shell && message != KsMessage::BetweenEditors())
            return 0; // tool bars
        QString line = QString("%1 %2").arg(shell ? "shell" : "others").arg(request);
        if (request == KsRequest::LocationShown) {
            const auto* item = dynamic_cast<const CKvrCBELocation*>(package->objects->front().get());
            line += QString(" %1 %2").arg(item->branch).arg(item->chainage);
        }
        log << line;
        if (request == KsRequest::LocationShown && answer)
            answer();
        if (request == KsRequest::BranchNames && !projectBranch.isEmpty()) {
            package->objects->push_back(nullptr);
            auto item = std::make_unique<CKvrCBEText>();
            item->text = projectBranch;
            package->objects->push_back(std::move(item));
        }
        return request == KsRequest::JoinProject ? project : 0;
    }

    static QString ReadCrossSections(const QString& path, CCrossSections& sections)
    {
        return ReadBy(path, [&](tqlHandle file, LoadReport& report) { sections = LoadCrossSections(file, report); });
    }
    static QString WriteCrossSections(const QString& path, const CCrossSections& sections)
    {
        const auto saved = SaveDeclaredFile(path.toStdString(), DeclaredSectionFile(), &sections);
        return saved ? QString() : QString::fromStdString(saved.error().message);
    }
    /// Opens sections in a window.
    CCrossSectionView* Open(const QByteArray& text = SmallSections)
    {
        auto* view = static_cast<CCrossSectionView*>(
            OpenIn({1000, 800}, CrossSectionEditor().CreateTemplate(), Write("river.kvxs", text)));
        if (view)
            view->Sections()->setFocus();
        return view;
    }
    static void UndoAll(CCrossSectionView* view)
    {
        while (view->Document()->UndoStack().canUndo())
            view->Document()->UndoStack().undo();
    }

    QString projectBranch;
    std::function<void()> answer; // what another editor does when it hears of a place
};
