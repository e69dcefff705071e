// The map's keys and mouse.
#pragma once

#include <QObject>
#include <QPoint>
#include <optional>

class CNetworkMap;
class QKeyEvent;
class QMouseEvent;

/// Turns what the user does with keys and mouse into what a map can do.
class CMapInput : public QObject
{
    Q_OBJECT
public:
    explicit CMapInput(CNetworkMap& map);

protected:
    bool eventFilter(QObject* object, QEvent* event) override;

private:
    bool Key(const QKeyEvent& event);
    void OpenMenu(const std::optional<QPoint>& at);
    void Mouse(const QMouseEvent& event);

    CNetworkMap& m_map;
    std::optional<QPoint> m_pressed, m_dragged; // where a button went down, and where the map was dragged to since
};
