// The map of a network: branches, their names and flow directions, the locations of HD documents; places are picked and
// locations selected on it.
#pragma once

#include "editors/network/map_painter.h"

#include <QPixmap>
#include <QWidget>
#include <optional>

struct CLegend;

class CNetworkMap : public QWidget
{
    Q_OBJECT
    // For programs that read the screen, and those that drive it.
    Q_PROPERTY(QString marked READ MarkedText)
    Q_PROPERTY(int placedCount READ PlacedCount)
public:
    /// The document outlives the map.
    explicit CNetworkMap(const CNetworkDoc& document, QWidget* parent = nullptr);
    ~CNetworkMap() override;

    void SetLocations(std::vector<CMapLocation> locations);
    const std::vector<CMapLocation>& Locations() const { return m_locations; }
    /// How many of them are at a place of the network.
    std::size_t PlacedCount() const { return m_placed.size(); }

    /// A place on a branch, by name.
    struct Place
    {
        QString branch;
        double chainage = 0; // metres
        bool operator==(const Place&) const = default;
    };
    /// What the user picked, while it is in the network.
    std::optional<Place> Picked() const;
    void SetPicked(std::optional<Place> place);
    /// The location that is selected; null for none. Valid until the locations change.
    const CMapLocation* Selected() const;
    /// "BRANCH 1234.5" of the location selected, else of the place picked, else of the place shown; in metres.
    QString MarkedText() const;
    /// Marks a place and brings it into sight.
    void ShowPlace(const Place& place);
    void SetCurrentBranch(int branch);

    void FitAll();
    /// Around the middle of the window.
    void Zoom(double factor);
    /// By pixels of the user: what is shown moves right and down.
    void Pan(const QPoint& distance);
    /// In window coordinates; none for a place that is nowhere.
    std::optional<QPointF> WindowPoint(const Place& place) const;
    /// Where a location's symbol is; none when it is not on the map.
    std::optional<QPointF> SymbolPoint(std::size_t location) const;

    QSize sizeHint() const override { return {640, 480}; }

signals:
    void PickedChanged();
    void SelectionChanged();
    void DeleteRequested();
    /// The menu for what is picked or selected, at a global position.
    void MenuRequested(const QPoint& position);

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void changeEvent(QEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void contextMenuEvent(QContextMenuEvent* event) override;
    bool event(QEvent* event) override;

private:
    static constexpr int LabelMemory = 32 << 20; // bytes
    struct Key;
    static const std::vector<Key>& Keys();
    void NetworkChanged();
    void PlaceAll();
    void SceneChanged();
    const CMapScene& Scene() const;
    QRectF FullExtent() const;
    void ZoomAt(const QPointF& window, double factor);
    void UpdateBuffer();
    void PickAt(const QPointF& window);
    void PickMiddle();
    void StepLocation(int step);
    void SelectLocation(int location);
    void Unmark();
    int LocationAt(const QPointF& window) const;
    CLegend Legend() const;
    void FitInto(const QRectF& part);
    bool IsUnder(const QRectF& box) const;
    QString LocationText(const CMapLocation& location) const;
    void PaintMarks(QPainter& painter, const CMapStyle& style) const;
    void KeepInSight(const QPointF& window);

    const CNetworkDoc& m_document;
    std::vector<CMapLocation> m_locations;
    std::vector<CPlacedLocation> m_placed;
    CMapProjection m_projection;
    bool m_fitted = false;                      // keep all in sight while the window is resized
    mutable std::vector<QPainterPath> m_names;  // of the branches; empty when something changed
    mutable std::unique_ptr<CMapScene> m_scene; // of the present scale; null when something changed

    QPixmap m_buffer; // the window without marks
    QPoint m_bufferOffset;
    CMapPainter::LabelPictures m_labelPictures{LabelMemory}; // of the present scene
    bool m_bufferValid = false;

    std::optional<Place> m_picked, m_shown;
    int m_selected = -1, m_currentBranch = -1;
    QPoint m_pressed, m_dragged;
    bool m_pressing = false, m_dragging = false;
};
