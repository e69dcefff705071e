// What a value means, in words beside its field: on pages that have the room for it.
#pragma once

#include <QStringList>
#include <QWidget>

/// Shows as much of the text as its width and the height of its row have room for. The tool tip of the field has all
/// of it.
class CFieldMeaning : public QWidget
{
    Q_OBJECT
public:
    explicit CFieldMeaning(QWidget* parent);
    void SetText(const QString& text);
    const QString& Text() const { return m_text; }
    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    QStringList Lines() const;

    QString m_text;
};
