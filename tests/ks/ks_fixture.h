// A small document kind, a frame, and answers to the questions the user would get.
#pragma once

#include "ks/fc/doc_template.h"
#include "ks/fc/file_dialog.h"
#include "ks/fc/frames.h"
#include "ks/fc/message_box.h"

#include <QApplication>
#include <QFile>
#include <QFileInfo>
#include <QLineEdit>
#include <QTemporaryDir>
#include <QTest>
#include <QVBoxLayout>
#include <functional>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

/// One text; saved under the extension ".TST", whatever the user typed.
class TextDoc : public CKsDoc
{
public:
    BOOL OnOpenDocument(const CString& path) override
    {
        if (!CKsDoc::OnOpenDocument(path))
            return false;
        QFile file(path);
        text = file.open(QIODevice::ReadOnly) ? QString::fromUtf8(file.readAll()) : QString();
        return text != "refuse";
    }
    BOOL OnSaveDocument(const CString& path) override
    {
        QFile file(SavePathFor(path));
        executing = IsExecuting();
        if (!canSave || !file.open(QIODevice::WriteOnly)) {
            if (!why.isEmpty())
                TellNotSaved(why);
            onRefused();
            return false;
        }
        file.write(text.toUtf8());
        if (namesItself)
            SetPathName(SavePathFor(path));
        SetModifiedFlag(false);
        return true;
    }
    CString SavePathFor(const CString& path) const override
    {
        const QFileInfo info(path);
        return info.path() + "/" + info.completeBaseName() + ".TST";
    }
    void DeleteContents() override
    {
        CKsDoc::DeleteContents();
        text.clear();
    }

    QString text, why; // it says when it cannot be saved
    std::function<void()> onRefused = [] {};
    bool canSave = true, namesItself = false, executing = false;
};

/// Logs what it hears: "name hint" for updates, "name +a-b" for activation.
class LogView : public CView, public CCommandTarget
{
public:
    inline static QStringList log;

    LogView()
    {
        auto* layout = new QVBoxLayout(this);
        layout->addWidget(edit = new QLineEdit);
    }
    ~LogView() override { log << name + " gone " + (GetDocument() ? GetDocument()->GetTitle() : QString("?")); }
    bool MayLeave(KsLeave what) override
    {
        log << name + (what == KsLeave::Page ? " leaves" : " leaves field");
        if (edit->text() == "wrong")
            return false;
        if (!edit->isModified())
            return true;
        edit->setModified(false);
        static_cast<TextDoc*>(GetDocument())->text = edit->text();
        GetDocument()->SetModifiedFlag();
        return true;
    }
    void OnInitialUpdate() override { log << name + " initial " + GetDocument()->GetTitle(); }
    void OnUpdate(CView* sender, int hint, CHint* object) override
    {
        log << QString("%1 %2%3%4")
                   .arg(name)
                   .arg(hint)
                   .arg(sender ? " from another" : "", object ? " with object" : "");
    }
    void OnActivateView(bool activate, CView* activated, CView* deactivated) override
    {
        log << name + (activate ? " on " : " off ") + Name(activated) + " " + Name(deactivated);
    }
    bool OnCommand(int id) override
    {
        log << QString("%1 command %2").arg(name).arg(id);
        return true;
    }
    bool IsCommandEnabled(int id) const override { return id == enabledCommand; }

    static QString Name(CView* view) { return view ? static_cast<LogView*>(view)->name : QString("-"); }
    QString name = "v";
    QLineEdit* edit;
    int enabledCommand = 0;
};

class KsTest : public testing::Test
{
protected:
    KsTest()
        : documents(1, "Help.chm\nText\nText file\nTexts (*.tst)\n.tst\nText.Document\nText Document",
                    {[] { return new TextDoc; }, [] { return new CKsMDIChildWnd; },
                     [this] {
                         auto* view = new LogView;
                         view->name = QString(QChar('a' + made++));
                         return view;
                     }})
    {
        LogView::log.clear();
        KsSetMessageBoxHandler([this](const CString& text, QMessageBox::StandardButtons) {
            asked << text;
            return answers.isEmpty() ? QMessageBox::Ok : answers.takeFirst();
        });
        KsSetFileDialogHandler([this](const KsFileQuestion& question) {
            questions.push_back(question);
            return names.isEmpty() ? QString() : names.takeFirst();
        });
        frame.resize(600, 400);
        frame.show();
        EXPECT_TRUE(QTest::qWaitForWindowActive(&frame));
    }
    ~KsTest() override
    {
        KsSetMessageBoxHandler({});
        KsSetFileDialogHandler({});
    }

    QString Path(const QString& name) const { return folder.filePath(name); }
    QString Write(const QString& name, const QByteArray& text) const
    {
        QFile file(Path(name));
        EXPECT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(text);
        return file.fileName();
    }
    static QByteArray Read(const QString& path)
    {
        QFile file(path);
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray("(no file)");
    }
    TextDoc* Open(const QString& path) { return static_cast<TextDoc*>(documents.OpenDocumentFile(&frame, path)); }
    static LogView* ViewOf(const CKsDoc* document) { return static_cast<LogView*>(document->Views().at(0)); }
    static QMdiSubWindow* WindowOf(const CKsDoc* document)
    {
        return qobject_cast<QMdiSubWindow*>(document->Views().at(0)->parentWidget());
    }
    static void Settle() { QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete); }

    QTemporaryDir folder;
    int made = 0;
    CMultiDocTemplate documents;
    CKsMDIFrameWnd frame; // goes first, with the windows
    QStringList asked, names;
    QList<QMessageBox::StandardButton> answers;
    std::vector<KsFileQuestion> questions;
};
