// A few cross sections, and a shell that answers their view's requests.
#pragma once

#include "editors/cross_sections/module.h"
#include "editors/cross_sections/view.h"
#include "ks/fc/doc_template.h"
#include "ks/fc/message_box.h"

#include <QFile>
#include <QTableView>
#include <QTemporaryDir>
#include <QTest>
#include <QUndoStack>
#include <cmath>
#include <functional>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

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

class CrossSectionTest : public testing::Test, public CKsWindow
{
protected:
    CrossSectionTest()
    {
        KsSetMainWindow(this);
        KsSetMessageBoxHandler([this](const CString& text, QMessageBox::StandardButtons) {
            boxes << text;
            return QMessageBox::Ok;
        });
    }
    ~CrossSectionTest() override
    {
        frame.reset();
        KsSetMessageBoxHandler({});
        KsSetMainWindow(nullptr);
        KsUnits::Instance().SetSystem(KsUnitSystem::Metric);
    }

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

    QString Write(const QString& name, const QByteArray& text) const
    {
        QFile file(folder.filePath(name));
        EXPECT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(text);
        return file.fileName();
    }
    static QByteArray Read(const QString& path)
    {
        QFile file(path);
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray("(no file)");
    }

    /// Opens sections in a window.
    CCrossSectionView* Open(const QByteArray& text = SmallSections)
    {
        frame = std::make_unique<CKsMDIFrameWnd>();
        frame->resize(1000, 600);
        frame->show();
        documents.reset(CrossSectionModule::CreateTemplate());
        auto* document = documents->OpenDocumentFile(frame.get(), Write("river.kvxs", text));
        if (!document)
            return nullptr;
        EXPECT_TRUE(QTest::qWaitForWindowActive(frame.get()));
        auto* view = static_cast<CCrossSectionView*>(document->Views().at(0));
        view->Sections()->setFocus();
        return view;
    }
    static LRESULT Ask(CCrossSectionView* view, WPARAM request, CObList* objects)
    {
        CKSComm_Package package;
        package.objects = objects;
        return KsSendMessage(view, KsMessage::BetweenEditors(), request, reinterpret_cast<LPARAM>(&package));
    }
    static std::unique_ptr<CKvrCBELocation> Location(const char* branch, double chainage, double radius = KsUnset)
    {
        auto item = std::make_unique<CKvrCBELocation>();
        item->branch = branch;
        item->chainage = chainage;
        item->radius = radius;
        return item;
    }
    static void Select(QTableView* table, int row) { table->setCurrentIndex(table->model()->index(row, 0)); }
    static QString Text(const QTableView* table, int row, int column, int role = Qt::DisplayRole)
    {
        return table->model()->index(row, column).data(role).toString();
    }
    static bool Edit(QTableView* table, int row, int column, const QString& text)
    {
        return table->model()->setData(table->model()->index(row, column), text);
    }
    static void UndoAll(CCrossSectionView* view)
    {
        while (view->Document()->UndoStack().canUndo())
            view->Document()->UndoStack().undo();
    }

    QTemporaryDir folder;
    QStringList boxes, log;
    std::intptr_t project = 7;
    QString projectBranch;
    std::function<void()> answer; // what another editor does when it hears of a place
    std::unique_ptr<CMultiDocTemplate> documents;
    std::unique_ptr<CKsMDIFrameWnd> frame;
};
