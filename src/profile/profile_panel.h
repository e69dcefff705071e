// The long profile as a window: a branch, what is shown of it, the plot.
#pragma once

#include "profile/profile_content.h"

#include <QTimer>
#include <QWidget>
#include <functional>
#include <memory>

class QAction;
class QComboBox;
class QLabel;
class QMenu;
class QToolBar;
class QUndoStack;

class CProfilePanel : public QWidget
{
    Q_OBJECT
public:
    /// Both outlive it.
    CProfilePanel(IProfileHost& host, const QUndoStack& steps, QWidget* parent = nullptr);
    ~CProfilePanel() override;

    /// Tables, cross sections, units or language are other ones: shown once the present event is over.
    void Refresh();
    /// The line that is current, by its place in the file, at a place of the river: metres. Another branch is shown
    /// then.
    void SetCurrent(int tab, std::size_t row, const QString& branch, double chainage);
    /// A place that the user looks at in another editor; only of the branch that is shown.
    void SetPlace(const QString& branch, double chainage);
    /// Null where the library is missing that draws.
    IPlot* Plot() const { return m_plot.get(); }
    /// What is shown, drawn at once.
    const Profile& Shown();

protected:
    void showEvent(QShowEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    void MakePlot();
    void MakeActions();
    void Retranslate();
    void ShowNow();
    void ShowBranches();
    void ShowBranch(const QString& branch);
    void FillTracks();
    void MarkCurrent();
    void Describe(const std::vector<PlotPoint>& points);
    bool IsTrue() const;
    QString TextOf(int track, double value) const;
    PlotHandlers Handlers();
    void Picked(const PlotPoint& point);
    void Moved(const PlotPoint& point, double x, double y);
    void Added(int track, double x, double y);
    QString Dragging(const PlotPoint& point, double x, double y) const;
    void Export();
    void Print();
    void CopyAll();
    QString TableText() const;

    IProfileHost& m_host;
    const QUndoStack& m_steps;
    std::unique_ptr<IPlot> m_plot;
    QToolBar* m_bar;
    QComboBox* m_branches;
    QLabel* m_reason; // instead of the plot
    QMenu* m_tracks;
    QAction *m_choose, *m_fit, *m_in, *m_out, *m_copy, *m_export, *m_print;
    Profile m_profile;
    int m_madeAt = -1; // the step at which it was made
    bool m_isDirty = true, m_fits = true;
    QTimer m_later;        // until it is shown anew
    qint64 m_cost = 0;     // of that, the last time; milliseconds
    int m_front = -1;      // the tab for which it was made
    QSet<QString> m_shown; // keys of tracks
    QString m_branch;      // key
    struct
    {
        int tab = -1;
        std::size_t row = 0;
        QString branch;
        double chainage = 0;
    } m_current;
};
