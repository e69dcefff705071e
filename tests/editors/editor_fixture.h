// What the tests of the editors beside the HD parameters share: a folder, a window, and a shell that notes what it
// hears.
#pragma once

#include "grid/gen_grid.h"
#include "grid/grid_editors.h"
#include "grid/row_commands.h"
#include "ks/fc/doc_template.h"
#include "ks/fc/exchange.h"
#include "ks/fc/frames.h"
#include "ks/fc/message_box.h"
#include "ks/units/edit_style.h"

#include <QComboBox>
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

    static QString Text(const CGenGrid* table, int row, int column, int role = Qt::DisplayRole)
    {
        return table->model()->index(row, column).data(role).toString();
    }
    /// Opens the cell's editor and replaces what stands there.
    static QWidget* Type(CGenGrid* table, int row, int column, const QString& text)
    {
        table->setFocus();
        table->SetCurrentCell(row + 1, column + 1);
        QTest::keyClick(table, Qt::Key_F2);
        QWidget* editor = table->Delegate()->Editor();
        if (auto* field = qobject_cast<QLineEdit*>(editor)) {
            field->selectAll();
            field->insert(text);
        } else if (auto* list = qobject_cast<QComboBox*>(editor)) {
            list->setCurrentText(text);
        }
        return editor;
    }
    /// Likewise, and leaves the cell. False when it refuses the text, which is given up then.
    static bool Edit(CGenGrid* table, int row, int column, const QString& text)
    {
        QWidget* editor = Type(table, row, column, text);
        if (editor && !table->CommitEditor()) {
            QTest::keyClick(editor, Qt::Key_Escape);
            return false;
        }
        table->StoreEditedLine();
        return editor != nullptr;
    }
    static void Select(CGenGrid* table, int row) { table->SetCurrentCell(row + 1, 1); }
    /// Takes lines out of a table's rows, as one step.
    static void Remove(CKsDoc& document, const std::shared_ptr<IRowSource>& rows, std::size_t row, std::size_t count)
    {
        DeleteLines(document, rows, row, count);
    }

    /// What the shell asks of the plug-in KVR_PLUGIN, which has one document template and one tool bar.
    static void CheckPlugin(const char* file, const char* filter, const char* editor, const char* toolBar);

    QTemporaryDir folder;
    QStringList boxes, log;
    std::intptr_t project = 7;
    std::unique_ptr<CMultiDocTemplate> documents;
    std::unique_ptr<CKsMDIFrameWnd> frame;
};
