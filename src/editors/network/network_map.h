// The map of a network: branches, their names and flow directions, the locations of HD documents; places are picked and
// locations selected on it.
#pragma once

#include "editors/network/map_buffer.h"
#include "editors/network/map_selection.h"

#include <QWidget>

class CNetworkMap : public QWidget
{
    Q_OBJECT
public:
    /// The document outlives the map.
    explicit CNetworkMap(const CNetworkDoc& document, QWidget* parent = nullptr);

    /// The locations, and what is picked and selected.
    CMapSelection& Marks() { return m_marks; }
    const CMapSelection& Marks() const { return m_marks; }
    /// Marks a place and brings it into sight.
    void ShowPlace(const CMapPlace& place);
    void SetCurrentBranch(int branch);

    void FitAll();
    static constexpr double ZoomStep = 1.4;
    /// Around the middle of the window.
    void Zoom(double factor) { ZoomAt(QRectF(rect()).center(), factor); }
    void ZoomAt(const QPointF& window, double factor);
    /// By pixels of the user: what is shown moves right and down.
    void Pan(const QPoint& distance);
    /// Picks the place, or selects the location, at a position of the window; far from all of them, nothing.
    void PickAt(const QPointF& window);
    /// Without a mouse: the place that is nearest to the middle of the window.
    void PickMiddle();
    /// To the next location along the branches, or back.
    void StepLocation(int step);
    void Unmark();
    /// In window coordinates; none for a place that is nowhere.
    std::optional<QPointF> WindowPoint(const CMapPlace& place) const;
    /// Where a location's symbol is; none when it is not on the map.
    std::optional<QPointF> SymbolPoint(std::optional<std::size_t> location) const;
    /// The location whose symbol is at a position of the window.
    std::optional<std::size_t> LocationAt(const QPointF& window) const;

    QSize sizeHint() const override { return {640, 480}; }

signals:
    void DeleteRequested();
    /// The menu for what is picked or selected, at a global position.
    void MenuRequested(const QPoint& position);

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    void NetworkChanged();
    void SceneChanged();
    void MarksChanged();
    void ScreenChanged();
    const CMapScene& Scene() const;
    QRectF Device(const QRectF& window) const;
    std::optional<CMapPlace> Nearest(const QPointF& window, double reach) const;
    void KeepInSight(const std::optional<QPointF>& window);

    const CNetworkDoc& m_document;
    CMapSelection m_marks;
    CMapProjection m_projection;
    bool m_fitted = true;                       // keep all in sight while the window is resized
    mutable std::vector<QPainterPath> m_names;  // of the branches; empty when something changed
    mutable std::unique_ptr<CMapScene> m_scene; // of the present scale; null when something changed
    CMapBuffer m_buffer;
    int m_currentBranch = -1;
};
