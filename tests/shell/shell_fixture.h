// The shell with the test editor, and answers to its questions.
#pragma once

#include "ks/fc/file_dialog.h"
#include "ks/fc/message_box.h"
#include "shell/main_frame.h"

#include <QAction>
#include <QApplication>
#include <QFile>
#include <QFileInfo>
#include <QLineEdit>
#include <QMenu>
#include <QMenuBar>
#include <QSettings>
#include <QTemporaryDir>
#include <QTest>
#include <QUndoStack>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

class ShellTest : public testing::Test
{
protected:
    ShellTest()
    {
        QSettings().clear();
        KsSetMessageBoxHandler([this](const CString& text, QMessageBox::StandardButtons) {
            asked << text;
            return answers.isEmpty() ? QMessageBox::Ok : answers.takeFirst();
        });
        KsSetFileDialogHandler(
            [this](const KsFileQuestion&) { return names.isEmpty() ? QString() : names.takeFirst(); });
        Start();
    }
    ~ShellTest() override
    {
        frame.reset();
        KsSetMessageBoxHandler({});
        KsSetFileDialogHandler({});
    }
    /// Starts the program anew, with the settings that are there.
    void Start()
    {
        frame.reset();
        frame = std::make_unique<CMainFrame>();
        frame->LoadPlugins(TEST_EDITORS);
        frame->show();
        EXPECT_TRUE(QTest::qWaitForWindowActive(frame.get()));
    }

    QString Path(const QString& name) const { return QDir(folder.path()).absoluteFilePath(name); }
    QString Write(const QString& name, const QByteArray& text = "x") const
    {
        QDir(folder.path()).mkpath(QFileInfo(Path(name)).path());
        QFile file(Path(name));
        EXPECT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(text);
        return file.fileName();
    }
    QString WriteProject(const QString& name, const QByteArray& members) const
    {
        return Write(name, "[KVR_PROJECT]\n[Members]\n" + members + "[/Members]\n[/KVR_PROJECT]\n");
    }
    CMultiDocTemplate& Texts() const { return *CMultiDocTemplate::All().at(0); }
    CView* ViewOf(const QString& name) const
    {
        const CKsDoc* document = Texts().FindDocument(Path(name));
        return document ? document->Views().at(0) : nullptr;
    }
    std::intptr_t ProjectOf(const QString& name) const { return ViewOf(name)->property("project").toLongLong(); }
    static QStringList TakeLog(CView* view)
    {
        const QStringList log = view->property("log").toStringList();
        view->setProperty("log", QVariant());
        return log;
    }
    QAction* Action(const char* name) const { return frame->findChild<QAction*>(name); }
    QMenu* Menu(int position) const { return frame->menuBar()->actions().at(position)->menu(); }
    void Activate(const QString& name) const { Texts().OpenDocumentFile(frame.get(), Path(name)); }
    static void Settle() { QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete); }

    QTemporaryDir folder;
    std::unique_ptr<CMainFrame> frame;
    QStringList asked, names;
    QList<QMessageBox::StandardButton> answers;
};
