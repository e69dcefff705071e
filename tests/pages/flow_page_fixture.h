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
};
