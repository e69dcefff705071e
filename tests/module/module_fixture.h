// A folder for files, recorded message boxes, and a main window that answers the switchboard.
#pragma once

#include "ks/fc/message_box.h"
#include "ks/fc/messages.h"
#include "ks/fc/package.h"
#include "document/document.h"

#include <QFile>
#include <QTemporaryDir>
#include <gtest/gtest.h>

class ModuleTest : public testing::Test, public CKsWindow
{
protected:
    struct Message
    {
        unsigned message;
        WPARAM request;
        CString text;
        int kind;
        std::intptr_t project;
        CView* view;
    };

    ModuleTest()
    {
        KsSetMainWindow(this);
        KsSetMessageBoxHandler([this](const CString& text, QMessageBox::StandardButtons) {
            boxes << text;
            return answer;
        });
    }
    ~ModuleTest() override
    {
        KsSetMessageBoxHandler({});
        KsSetMainWindow(nullptr);
    }

    LRESULT WindowProc(unsigned message, WPARAM wParam, LPARAM lParam) override
    {
        const auto* package = reinterpret_cast<const CKSComm_Package*>(lParam);
        messages.push_back({message, wParam, package->text, package->kind, package->project, package->view});
        return message == KsMessage::SwitchBoard() && wParam == KsRequest::JoinProject ? projectHandle : 0;
    }

    CString Path(const char* name) const { return folder.filePath(name); }
    void Write(const CString& path, const QByteArray& content) const
    {
        QFile file(path);
        ASSERT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(content);
    }
    QByteArray Read(const CString& path) const
    {
        QFile file(path);
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray("(no file)");
    }

    QTemporaryDir folder;
    QStringList boxes;
    QMessageBox::StandardButton answer = QMessageBox::Ok;
    std::vector<Message> messages;
    std::intptr_t projectHandle = 0;
};

inline constexpr const char* SmallFile = "[KAVO0_HD]\n"
                                         "  [Global_Variables]\n"
                                         "    [Global_Values]\n"
                                         "      G_waterlevel = 1.5\n"
                                         "    [/Global_Values]\n"
                                         "  [/Global_Variables]\n"
                                         "  [InitList]\n"
                                         "    DATA = \"MAIN\", 100, 2.5, 30\n"
                                         "    DATA = \"\", 200, 1, 1\n"
                                         "    DATA = \"MAIN\", 10000000000.0, 1, 1\n"
                                         "  [/InitList]\n"
                                         "  [NextVersionList]\n"
                                         "    DATA = \"MAIN\", 7, \"kept\"\n"
                                         "  [/NextVersionList]\n"
                                         "[/KAVO0_HD]\n";
