// What the tests of the editors beside the HD parameters share: a folder, a window, and a shell that notes what it
// hears.
#pragma once

#include "ks/fc/doc_template.h"
#include "ks/fc/exchange.h"
#include "ks/fc/frames.h"
#include "ks/fc/message_box.h"
#include "ks/units/edit_style.h"

#include <QFile>
#include <QTemporaryDir>
#include <QTest>
#include <QUndoStack>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

/// A derived fixture resets `frame` in its own destructor: its window talks to the shell until it is gone.
class EditorTest : public testing::Test, public CKsWindow
{
protected:
    EditorTest()
    {
        KsSetMainWindow(this);
        KsSetMessageBoxHandler([this](const CString& text, QMessageBox::StandardButtons) {
            boxes << text;
            return QMessageBox::Ok;
        });
    }
    ~EditorTest() override
    {
        KsSetMessageBoxHandler({});
        KsSetMainWindow(nullptr);
        KsUnits::Instance().SetSystem(KsUnitSystem::Metric);
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

    /// Opens a file in a window of that size; null when the editor refused it.
    CView* OpenIn(const QSize& size, CMultiDocTemplate* editor, const QString& file)
    {
        frame = std::make_unique<CKsMDIFrameWnd>();
        frame->resize(size);
        frame->show();
        documents.reset(editor);
        auto* document = documents->OpenDocumentFile(frame.get(), file);
        if (!document)
            return nullptr;
        EXPECT_TRUE(QTest::qWaitForWindowActive(frame.get()));
        return document->Views().at(0);
    }
    static LRESULT Ask(CView* view, WPARAM request, CObList* objects)
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

    /// What the shell asks of the plug-in KVR_PLUGIN, which has one document template and one tool bar.
    static void CheckPlugin(const char* file, const char* filter, const char* editor, const char* toolBar);

    QTemporaryDir folder;
    QStringList boxes, log;
    std::intptr_t project = 7;
    std::unique_ptr<CMultiDocTemplate> documents;
    std::unique_ptr<CKsMDIFrameWnd> frame;
};
