// What a page does to the file: each control changes its keyword and nothing else.
#pragma once

#include "page_fixture.h"

#include "data/hd_file.h"

#include <QLabel>

class FlowPagesTest : public PageTest
{
protected:
    /// A control by its number.
    template <typename T = QWidget>
    T* Find(int number) const
    {
        for (T* control : view->page->findChildren<T*>())
            if (control->objectName().endsWith(QString("_%1").arg(number)) && (!qobject_cast<QLabel*>(control)))
                return control;
        ADD_FAILURE() << "no control " << number;
        return nullptr;
    }
    void TypeInto(int number, const char* text)
    {
        auto* field = Find<QLineEdit>(number);
        field->setFocus();
        field->selectAll();
        QTest::keyClicks(field, text);
        QTest::keyClick(field, Qt::Key_Tab);
    }
    QStringList Lines() const { return QString::fromStdString(HDFileText(document.Parameters())).split('\n'); }
    /// The lines of the file that were not among `before`.
    QStringList Changed(const QStringList& before) const
    {
        QStringList changed;
        for (const QString& line : Lines())
            if (!before.contains(line))
                changed << line.trimmed();
        return changed;
    }
    struct Edit
    {
        int control;
        const char* typed; // into a field; a key for anything else
        const char* line;  // of the file
    };
    /// Each edit changes its keyword and nothing else, marks the document, and is one step to undo.
    void EachChangesItsKeyword(std::initializer_list<Edit> edits)
    {
        for (const Edit& edit : edits) {
            SCOPED_TRACE(edit.line);
            const QStringList before = Lines();
            document.SetModifiedFlag(false);
            const int steps = document.UndoStack().index();
            QWidget* control = Find(edit.control);
            if (qobject_cast<QLineEdit*>(control)) {
                TypeInto(edit.control, edit.typed);
            } else {
                control->setFocus();
                QTest::keyClick(control, *edit.typed == ' ' ? Qt::Key_Space : Qt::Key_Up);
            }
            EXPECT_EQ(Changed(before).join('\n').toStdString(), edit.line);
            EXPECT_TRUE(document.IsModified());
            EXPECT_EQ(document.UndoStack().index(), steps + 1);
            QTest::keyClick(control, Qt::Key_Z, Qt::ControlModifier);
            EXPECT_TRUE(Lines() == before) << "undone";
            document.UndoStack().redo();
        }
        EXPECT_EQ(boxes, QStringList());
    }
    QStringList Headers() const
    {
        QStringList headers;
        for (int column = 0; column < grid->ColumnCount(); ++column)
            headers << grid->model()->headerData(column, Qt::Horizontal).toString();
        return headers;
    }
};
