// What the tests of the editors beside the HD parameters share: a folder, a window, and a shell that notes what it
// hears.
#pragma once

#include "grid/row_commands.h"
#include "ks/fc/doc_template.h"
#include "ks/fc/exchange.h"
#include "ks/fc/file_bar.h"
#include "ks/fc/findings_dialog.h"
#include "ks/fc/frames.h"
#include "ks/fc/message_box.h"
#include "ks/fc/project_doc.h"
#include "ks/units/edit_style.h"
#include "open_editor.h"

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
            return answer;
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

    /// Reads a file and says what was not taken as it stands: "line keyword: what stands there -> what is used", or why
    /// nothing was taken.
    template <typename Load>
    static QString ReadBy(const QString& path, Load load)
    {
        CKsDocumentFile file;
        file.Read(path, path, load);
        QStringList told{file.WhyNothing()};
        told.removeAll(QString());
        if (told.isEmpty())
            for (const Finding& each : file.Findings())
                told << QString("%1 %2: %3 -> %4")
                            .arg(each.line)
                            .arg(QString::fromStdString(each.keyword.empty() ? "[" + each.section + "]" : each.keyword),
                                 QString::fromStdString(each.found), QString::fromStdString(each.used));
        return told.join("; ");
    }
    /// Opens a file of which two places are not taken as they stand, and saves it. `lines`: "line, what is expected".
    void CheckFindings(CView* view, const QStringList& lines)
    {
        ASSERT_NE(view, nullptr);
        EXPECT_TRUE(boxes.isEmpty());
        auto* document = static_cast<CKsProjectDoc*>(view->GetDocument());
        EXPECT_TRUE(view->findChild<CKsFileBar*>()->isVisible());
        ASSERT_TRUE(QTest::qWaitFor([&] { return view->findChild<CKsFindingsDialog*>() != nullptr; }));
        const auto* model = view->findChild<CKsFindingsModel*>();
        QStringList rows;
        for (int row = 0; row < model->rowCount(); ++row)
            rows << model->index(row, 0).data().toString() + ", " + model->index(row, 6).data().toString();
        EXPECT_EQ(rows, lines);

        const QString path = document->GetPathName();
        const QByteArray before = Read(path);
        EXPECT_FALSE(document->DoSave(path));
        ASSERT_EQ(boxes.size(), 1);
        EXPECT_TRUE(boxes.takeFirst().contains(QFileInfo(path).fileName() + ".original-1"));
        EXPECT_EQ(Read(path), before);
        answer = QMessageBox::Yes;
        EXPECT_TRUE(document->DoSave(path));
        EXPECT_EQ(Read(path + ".original-1"), before);
        EXPECT_EQ(document->File().KeptCopy(), path + ".original-1");
        EXPECT_TRUE(document->DoSave(path));
        EXPECT_EQ(boxes.size(), 1) << "asked once";
        EXPECT_NE(Read(path), before);
        EXPECT_TRUE(document->DoSave(folder.filePath("other." + QFileInfo(path).suffix())));
        EXPECT_EQ(document->File().KeptCopy(), "") << "a new file has no former state";
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
        QWidget* editor = OpenEditor(*table);
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
    QMessageBox::StandardButton answer = QMessageBox::Ok; // to every message
    std::intptr_t project = 7;
    std::unique_ptr<CMultiDocTemplate> documents;
    std::unique_ptr<CKsMDIFrameWnd> frame;
};
