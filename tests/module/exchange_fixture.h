// Documents in the windows of a main frame that is the switchboard too, with answers a test gives.
#pragma once

#include "module_fixture.h"

#include "data/hd_file.h"
#include "ks/fc/hd_messages.h"
#include "module/data_tables.h"
#include "module/kavo0_hd.h"
#include "module/sheet.h"
#include "module/view.h"
#include "pages/framework/ctrl_edit.h"
#include "grid/gen_grid.h"
#include "pages/framework/page.h"

#include <QApplication>
#include <QTest>
#include <QUndoStack>
#include <functional>
#include <sstream>

/// Counts the debug lines that requests leave which are not met.
class ExchangeLog
{
public:
    ExchangeLog() { s_count = 0, m_old = qInstallMessageHandler(&ExchangeLog::Write); }
    ~ExchangeLog() { qInstallMessageHandler(m_old); }
    static int Take() { return std::exchange(s_count, 0); }

private:
    static void Write(QtMsgType, const QMessageLogContext&, const QString& text)
    {
        s_count += text.startsWith("HD data exchange") || text.contains(" without a package");
    }
    static inline int s_count = 0;
    QtMessageHandler m_old;
};

/// A list that an exported function returned.
using Owned = std::unique_ptr<CObList>;

/// What ExchangeTest::WriteFile writes, as ExchangeTest::Summary has it.
inline constexpr const char* AllItems =
    "0 MAIN 100, 0 SIDE 0.1, 1 MAIN 101, 1 SIDE 1.1, 2 MAIN 102, 2 SIDE 2.1, "
    "3 MAIN 103 to 250, 3 SIDE 3.1 to 0, 4 MAIN 104, 4 SIDE 4.1, 5 MAIN 105, 5 SIDE 5.1, "
    "6 MAIN 106, 6 SIDE 6.1";

class ExchangeTest : public ModuleTest
{
protected:
    struct Frame : CKsMDIFrameWnd
    {
        explicit Frame(ExchangeTest& owner) : test(owner) {}
        LRESULT WindowProc(unsigned message, WPARAM wParam, LPARAM lParam) override
        {
            return test.WindowProc(message, wParam, lParam);
        }
        ExchangeTest& test;
    };

    ExchangeTest()
    {
        KsSetMainWindow(&frame);
        frame.resize(900, 600);
        frame.show();
        frame.activateWindow();
        EXPECT_TRUE(QTest::qWaitForWindowActive(&frame));
    }

    LRESULT WindowProc(unsigned message, WPARAM wParam, LPARAM lParam) override
    {
        const LRESULT joined = ModuleTest::WindowProc(message, wParam, lParam);
        return answerShell && lParam ? answerShell(message, wParam, *reinterpret_cast<CKSComm_Package*>(lParam), joined)
                                     : joined;
    }

    /// A file with two lines in each of the seven tables: "MAIN" at 100 + type and "SIDE" at 0.1 + type.
    CString WriteFile(const char* name) const
    {
        HD_Parameters parameters;
        int type = 0;
        for (const HDDataTable& table : HDDataTables()) {
            for (const auto& [branch, chainage] : {std::pair("MAIN", 100.0), std::pair("SIDE", 0.1)}) {
                auto record = table.list(parameters).NewRecord();
                record->RiverName = branch;
                record->Chainage = chainage + type;
                table.list(parameters).AddTail(std::move(record));
            }
            ++type;
        }
        parameters.WaveList.GetAt(0).DownstreamChainage = 250;
        EXPECT_TRUE(SaveHDFile(parameters, Path(name).toStdString()));
        return Path(name);
    }
    CKavo0_hdView* Open(const CString& path)
    {
        CKsDoc* document = documents->OpenDocumentFile(&frame, path);
        return document ? static_cast<CKavo0_hdView*>(document->Views().at(0)) : nullptr;
    }
    static HD_Parameters& Parameters(const CKavo0_hdView& view) { return view.GetDocument()->Parameters(); }
    /// The lines of the file, without those that pages show in empty tables.
    static std::vector<std::string> FileText(const CKavo0_hdView& view)
    {
        std::vector<std::string> lines;
        std::istringstream text(HDFileText(Parameters(view)));
        for (std::string line; std::getline(text, line);)
            if (line.find("DATA = \"\", 1e+10") == std::string::npos)
                lines.push_back(line);
        return lines;
    }
    static CGenList& List(const CKavo0_hdView& view, int type) { return FindDataTable(type)->list(Parameters(view)); }

    static std::unique_ptr<CKvr_CBE_ModelDataItem> Item(int type, const char* branch, double chainage)
    {
        auto item = std::make_unique<CKvr_CBE_ModelDataItem>();
        item->branch = branch;
        item->chainage = chainage;
        item->type = type;
        return item;
    }
    static CObList Items(int type, const char* branch, double chainage)
    {
        CObList items;
        items.push_back(Item(type, branch, chainage));
        return items;
    }
    LRESULT Send(CView* receiver, WPARAM request, CObList* objects)
    {
        CKSComm_Package package;
        package.view = &other;
        package.objects = objects;
        return receiver->WindowProc(KsMessage::BetweenEditors(), request, reinterpret_cast<LPARAM>(&package));
    }
    /// "0 MAIN 100, ..."; a list that is null says so.
    static std::string Summary(const CObList* items)
    {
        if (!items)
            return "null";
        QStringList texts;
        for (const auto& object : *items) {
            const auto& item = dynamic_cast<const CKvr_CBE_ModelDataItem&>(*object);
            QString text = QString("%1 %2 %3").arg(item.type).arg(item.branch).arg(item.chainage);
            if (item.second == item.second)
                text += QString(" to %1").arg(item.second);
            texts << text;
        }
        return texts.join(", ").toStdString();
    }
    int Told(WPARAM news) const
    {
        return int(std::count_if(messages.begin(), messages.end(), [&](const Message& m) {
            return m.message == KsMessage::BetweenEditors() && m.request == news;
        }));
    }
    /// Shows the tab and types something into its first field that it will not take.
    static CCtrlEdit* TypeWrongInto(CKavo0_hdView& view, int tab)
    {
        EXPECT_TRUE(view.Sheet()->SetActivePage(tab));
        QCoreApplication::processEvents(); // a page that was just made is shown
        for (auto* field : view.ActivePage()->findChildren<CCtrlEdit*>()) {
            if (!field->isVisibleTo(&view) || !field->isEnabled())
                continue;
            field->setFocus();
            field->selectAll();
            QTest::keyClicks(field, "1e");
            return field;
        }
        ADD_FAILURE() << "no field on tab " << tab;
        return nullptr;
    }

    using ShellAnswer = std::function<LRESULT(unsigned message, WPARAM, CKSComm_Package&, LRESULT joined)>;
    ShellAnswer answerShell;
    std::unique_ptr<CMultiDocTemplate> documents{CKavo0_hd::CreateMainDlg()};
    Frame frame{*this}; // its windows go before the documents do
    CView other;        // of another editor
};
