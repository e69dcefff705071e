// What a value means, in words beside its field: on pages that have the room for it.
#pragma once

#include <QStringList>
#include <QWidget>

/// Wants as many lines as the text takes in its width, and shows as much of it as the height of its row has room for.
/// The tool tip of the field has all of it.
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
    void resizeEvent(QResizeEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    QStringList Lines(int most) const;
    void CountLines();

    QString m_text;
    int m_wanted = 2; // lines of the whole text in the present width, or what is usual
};
