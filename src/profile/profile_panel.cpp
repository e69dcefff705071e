#include "profile/profile_panel.h"

#include "grid/gen_grid.h"
#include "ks/fc/branch_name.h"
#include "ks/fc/file_dialog.h"
#include "ks/fc/message_box.h"
#include "ks/fc/shown_text.h"
#include "plot/plot_library.h"
#include "profile/profile_edit.h"
#include "profile/profile_texts.h"

#include <QAction>
#include <QApplication>
#include <QClipboard>
#include <QComboBox>
#include <QElapsedTimer>
#include <QEvent>
#include <QFileInfo>
#include <QLabel>
#include <QMenu>
#include <QMimeData>
#include <QPixmap>
#include <QSettings>
#include <QToolBar>
#include <QToolButton>
#include <QUndoStack>
#include <QVBoxLayout>
#include <algorithm>
#include <cmath>
#include <limits>

namespace {

const QString TracksKey = QStringLiteral("LongProfile/tracks");
constexpr double ZoomStep = 1.6;
constexpr int PictureWidth = 1600, PictureHeight = 900;

/// A number to no more digits than a step as small as `least` has.
double ToDigits(double number, double least)
{
    const double digits = std::max(0.0, std::ceil(-std::log10(least)));
    return std::round(number * std::pow(10, digits)) / std::pow(10, digits);
}

/// How far a value is from a curve; one without points is farther than any.
double DistanceTo(const PlotCurve& curve, double x, double y)
{
    if (curve.x.empty())
        return std::numeric_limits<double>::max();
    const auto behind = std::size_t(std::ranges::lower_bound(curve.x, x) - curve.x.begin());
    const std::size_t right = std::min(behind, curve.x.size() - 1), left = behind > 0 ? behind - 1 : 0;
    const double width = curve.x[right] - curve.x[left];
    const double there = width > 0 && behind < curve.x.size()
                             ? std::lerp(curve.y[left], curve.y[right], (x - curve.x[left]) / width)
                             : curve.y[right];
    return std::abs(there - y);
}

} // namespace

CProfilePanel::CProfilePanel(IProfileHost& host, const QUndoStack& steps, QWidget* parent)
    : QWidget(parent),
      m_host(host),
      m_steps(steps),
      m_bar(new QToolBar(this)),
      m_branches(new QComboBox(m_bar)),
      m_reason(new QLabel(this)),
      m_tracks(new QMenu(this))
{
    setObjectName(QStringLiteral("longProfile"));
    m_branches->setObjectName(QStringLiteral("profileBranch"));
    m_branches->setSizeAdjustPolicy(QComboBox::AdjustToContents);
    m_reason->setWordWrap(true);
    m_reason->setAlignment(Qt::AlignCenter);
    m_reason->setMargin(12);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(0);
    column->addWidget(m_bar);
    column->addWidget(m_reason, 1);
    m_bar->setToolButtonStyle(Qt::ToolButtonTextOnly);
    m_bar->addWidget(m_branches);
    MakeActions();
    const QStringList shown = QSettings().value(TracksKey, QStringList{LevelsTrack, ReachesTrack}).toStringList();
    m_shown = QSet<QString>(shown.begin(), shown.end());
    connect(m_branches, &QComboBox::activated, this, [this] { ShowBranch(m_branches->currentData().toString()); });
    m_later.setSingleShot(true);
    connect(&m_later, &QTimer::timeout, this, [this] {
        if (isVisible())
            ShowNow();
    });
    connect(&m_steps, &QUndoStack::indexChanged, this, &CProfilePanel::Refresh);
    connect(&KsUnits::Instance(), &KsUnits::Changed, this, [this] {
        m_fits = true;
        Refresh();
    });
    Retranslate();
}

CProfilePanel::~CProfilePanel() = default;

void CProfilePanel::MakeActions()
{
    m_choose = m_bar->addAction(QString());
    m_choose->setMenu(m_tracks);
    static_cast<QToolButton*>(m_bar->widgetForAction(m_choose))->setPopupMode(QToolButton::InstantPopup);
    m_bar->addSeparator();
    m_fit = m_bar->addAction(QString(), this, [this] { m_plot->Fit(); });
    m_in = m_bar->addAction(QString(), this, [this] { m_plot->Zoom(ZoomStep); });
    m_out = m_bar->addAction(QString(), this, [this] { m_plot->Zoom(1 / ZoomStep); });
    m_bar->addSeparator();
    m_copy = m_bar->addAction(QString(), this, &CProfilePanel::CopyAll);
    m_export = m_bar->addAction(QString(), this, &CProfilePanel::Export);
    m_print = m_bar->addAction(QString(), this, &CProfilePanel::Print);
    for (const auto& [action, name] :
         std::initializer_list<std::pair<QAction*, const char*>>{{m_choose, "profileTracks"},
                                                                 {m_fit, "profileFit"},
                                                                 {m_in, "profileZoomIn"},
                                                                 {m_out, "profileZoomOut"},
                                                                 {m_copy, "profileCopy"},
                                                                 {m_export, "profileExport"},
                                                                 {m_print, "profilePrint"}})
        action->setObjectName(QLatin1String(name));
    connect(m_tracks, &QMenu::aboutToShow, this, &CProfilePanel::FillTracks);
}

void CProfilePanel::Retranslate()
{
    const auto say = [](QAction* action, const QString& text, const QString& tip) {
        action->setText(text);
        action->setToolTip(tip);
        action->setStatusTip(tip);
    };
    m_branches->setAccessibleName(ProfileTexts::tr("Branch of the long profile"));
    m_branches->setToolTip(ProfileTexts::tr("The branch that is shown; it follows the current line"));
    say(m_choose, ProfileTexts::tr("Tracks"), ProfileTexts::tr("Chooses what is shown beside the page in front"));
    say(m_fit, ProfileTexts::tr("Show All"), ProfileTexts::tr("Shows the whole branch (Home)"));
    say(m_in, ProfileTexts::tr("Zoom In"), ProfileTexts::tr("Shows less of the branch in more detail (+)"));
    say(m_out, ProfileTexts::tr("Zoom Out"), ProfileTexts::tr("Shows more of the branch (-)"));
    say(m_copy, ProfileTexts::tr("Copy"), ProfileTexts::tr("Copies the picture, and the values as a table"));
    say(m_export, ProfileTexts::tr("Export..."), ProfileTexts::tr("Saves the picture as PNG, SVG or PDF"));
    say(m_print, ProfileTexts::tr("Print..."), ProfileTexts::tr("Prints the picture"));
    m_bar->setAccessibleName(ProfileTexts::tr("Long profile"));
    if (m_plot)
        m_plot->Widget().setAccessibleName(ProfileTexts::tr("Long profile"));
}

PlotHandlers CProfilePanel::Handlers()
{
    return {.picked = [this](const PlotPoint& point) { Picked(point); },
            .dragging = [this](const PlotPoint& point, double x, double y) { return Dragging(point, x, y); },
            .moved = [this](const PlotPoint& point, double x, double y) { Moved(point, x, y); },
            .added = [this](int track, double x, double y) { Added(track, x, y); },
            .removed =
                [this](const PlotPoint& point) {
                    if (m_host.MayLeaveField() && IsTrue())
                        RemoveProfileLine(m_profile, point);
                },
            .text = [this](int track, double value) { return TextOf(track, value); }};
}

/// When it is first shown: a program that shows no plot does not load what draws it.
void CProfilePanel::MakePlot()
{
    QString reason;
    const PlotLibrary* library = LoadPlotLibrary(reason);
    m_reason->setText(reason);
    m_reason->setVisible(!library);
    if (library) {
        m_plot = library->make(this, Handlers());
        m_plot->Widget().setObjectName(QStringLiteral("longProfilePlot"));
        m_plot->Widget().setAccessibleName(ProfileTexts::tr("Long profile"));
        layout()->addWidget(&m_plot->Widget());
        static_cast<QVBoxLayout*>(layout())->setStretchFactor(&m_plot->Widget(), 1);
        setFocusProxy(&m_plot->Widget());
    }
    for (QAction* action : m_bar->actions())
        action->setEnabled(library);
}

void CProfilePanel::showEvent(QShowEvent* event)
{
    QWidget::showEvent(event);
    if (!m_plot)
        MakePlot();
    Refresh();
}

void CProfilePanel::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        Retranslate();
        Refresh();
    }
}

// ---- what is shown -----------------------------------------------------------------------------

void CProfilePanel::Refresh()
{
    constexpr int quick = 30, pause = 300; // milliseconds: what nobody feels; when a user has paused
    m_isDirty = true;
    if (isVisible())
        m_later.start(m_cost > quick ? pause : 0); // a million lines must not hold up the next key
}

const Profile& CProfilePanel::Shown()
{
    ShowNow();
    return m_profile;
}

/// Whether the rows of the tables are still those of which the profile was made.
bool CProfilePanel::IsTrue() const
{
    return !m_isDirty && m_madeAt == m_steps.index();
}

void CProfilePanel::ShowNow()
{
    if (!m_plot || (IsTrue() && m_front == m_host.FrontTab()))
        return;
    QElapsedTimer time;
    time.start();
    ShowBranches();
    m_plot->Widget().setVisible(!m_branch.isEmpty());
    m_reason->setVisible(m_branch.isEmpty());
    m_reason->setText(ProfileTexts::tr("There is no branch yet: neither a line nor the network names one."));
    m_profile = MakeProfile(m_host, m_branch, m_shown);
    m_madeAt = m_steps.index();
    m_front = m_host.FrontTab();
    m_isDirty = false;
    m_plot->Show(m_profile.plot, std::exchange(m_fits, false));
    MarkCurrent();
    m_cost = time.elapsed();
}

void CProfilePanel::ShowBranches()
{
    QStringList branches = ProfileBranchesOf(m_host);
    if (m_branch.isEmpty() || !branches.contains(m_branch)) {
        m_branch = branches.contains(m_current.branch) ? m_current.branch : branches.value(0);
        m_fits = true;
    }
    QStringList known;
    for (int i = 0; i < m_branches->count(); ++i)
        known << m_branches->itemData(i).toString();
    if (known != branches) {
        m_branches->clear();
        for (const QString& branch : branches)
            m_branches->addItem(KsVisibleText(branch), branch);
    }
    m_branches->setCurrentIndex(int(branches.indexOf(m_branch)));
}

void CProfilePanel::ShowBranch(const QString& branch)
{
    if (branch == m_branch)
        return;
    m_branch = branch;
    m_fits = true;
    Refresh();
}

void CProfilePanel::FillTracks()
{
    m_tracks->clear();
    for (const ProfileTrack& track : m_profile.tracks) {
        QAction* action = m_tracks->addAction(KsTitleText(track.title));
        action->setCheckable(true);
        action->setChecked(m_shown.contains(track.key));
        connect(action, &QAction::toggled, this, [this, key = track.key](bool on) {
            on ? void(m_shown.insert(key)) : void(m_shown.remove(key));
            QStringList keys(m_shown.begin(), m_shown.end());
            keys.sort();
            QSettings().setValue(TracksKey, keys);
            Refresh();
        });
    }
}

void CProfilePanel::SetCurrent(int tab, std::size_t row, const QString& branch, double chainage)
{
    m_current = {tab, row, KsBranchKey(branch), chainage};
    if (!m_current.branch.isEmpty() && m_current.branch != m_branch) {
        m_branch = m_current.branch;
        m_fits = true;
        Refresh();
    } else if (m_front != m_host.FrontTab()) {
        Refresh();
    } else if (isVisible() && IsTrue()) {
        MarkCurrent();
    }
}

void CProfilePanel::SetPlace(const QString& branch, double chainage)
{
    if (m_plot && isVisible() && IsTrue() && KsBranchKey(branch) == m_branch)
        m_plot->Mark(CKsEditStyle(UnitGroup::Chainage).Conversion().ToShown(chainage), {});
}

void CProfilePanel::MarkCurrent()
{
    if (!m_plot)
        return;
    const auto table = std::ranges::find(m_profile.tables, m_current.tab, &ProfileTable::tab);
    if (table == m_profile.tables.end() || m_current.branch != m_branch || m_current.branch.isEmpty())
        return m_plot->Mark({}, {});
    const auto points = m_profile.PointsOf(int(table - m_profile.tables.begin()), m_current.row);
    m_plot->Mark(CKsEditStyle(UnitGroup::Chainage).Conversion().ToShown(m_current.chainage), points);
    Describe(points);
}

/// For those who hear the plot.
void CProfilePanel::Describe(const std::vector<PlotPoint>& points)
{
    QStringList texts{KsVisibleText(m_branch) + u' ' +
                      TextOf(-1, CKsEditStyle(UnitGroup::Chainage).Conversion().ToShown(m_current.chainage))};
    for (const PlotPoint& point : points) {
        const PlotCurve& curve = m_profile.plot.tracks[std::size_t(point.track)].curves[std::size_t(point.curve)];
        if (curve.end.empty())
            texts << QStringLiteral("%1: %2").arg(curve.name, TextOf(point.track, curve.y[point.point]));
    }
    m_plot->Widget().setAccessibleDescription(texts.join(QStringLiteral("; ")));
}

QString CProfilePanel::TextOf(int track, double value) const
{
    if (track < 0)
        return NumberText(KsShortestNumber(std::round(value * 1000) / 1000),
                          CKsEditStyle(UnitGroup::Chainage).UnitSymbol());
    const auto& units = m_profile.units[std::size_t(track)];
    return NumberText(KsFormatNumber(QStringLiteral("%.6lg"), value), units.empty() ? QString() : units.front());
}

// ---- what the user does ------------------------------------------------------------------------

void CProfilePanel::Picked(const PlotPoint& point)
{
    const ProfileCurve& source = m_profile.At(point);
    if (source.table < 0 || !IsTrue() || !m_host.MayLeaveField())
        return;
    m_host.ShowCell(m_profile.tables[std::size_t(source.table)], source.rows[point.point], source.column);
}

QString CProfilePanel::Dragging(const PlotPoint& point, double x, double y) const
{
    const ProfileCurve& source = m_profile.At(point);
    const double value = source.isDepth ? y - m_profile.bedAt(x) : y;
    return QStringLiteral("%1\n%2").arg(TextOf(-1, x), TextOf(point.track, value));
}

void CProfilePanel::Moved(const PlotPoint& point, double x, double y)
{
    const ProfileCurve& source = m_profile.At(point);
    if (source.table < 0 || !m_host.MayLeaveField() || !IsTrue())
        return;
    const PlotCurve& curve = m_profile.plot.tracks[std::size_t(point.track)].curves[std::size_t(point.curve)];
    const bool isAlong = x != curve.x[point.point];
    const ProfileTable table = m_profile.tables[std::size_t(source.table)];
    const std::size_t row = source.rows[point.point];
    const int column = isAlong ? 1 : source.column;
    isAlong ? MoveProfileLine(m_profile, point, x) : SetProfileValue(m_profile, point, y);
    m_host.ShowCell(table, row, column);
}

/// To the curve of the track that passes nearest.
void CProfilePanel::Added(int track, double x, double y)
{
    if (!m_host.MayLeaveField() || !IsTrue())
        return;
    int nearest = -1;
    double distance = 0;
    const auto& curves = m_profile.plot.tracks[std::size_t(track)].curves;
    for (std::size_t i = 0; i < curves.size(); ++i) {
        const double away = curves[i].isMovable ? DistanceTo(curves[i], x, y) : 0;
        if (curves[i].isMovable && (nearest < 0 || away < distance)) {
            nearest = int(i);
            distance = away;
        }
    }
    if (nearest < 0)
        return;
    const ProfileCurve& source = m_profile.curves[std::size_t(track)][std::size_t(nearest)];
    const ProfileTable table = m_profile.tables[std::size_t(source.table)];
    const int column = source.column;
    const auto [from, to] = m_plot->Range();
    const auto row = AddProfileLine(m_profile, track, nearest, ToDigits(x, (to - from) / PictureWidth),
                                    KsFormatNumber(QStringLiteral("%.4lg"), y).toDouble());
    if (row)
        m_host.ShowCell(table, *row, column);
}

// ---- out of the program ------------------------------------------------------------------------

void CProfilePanel::Export()
{
    const QString file = KsAskFileName({.save = true,
                                        .title = ProfileTexts::tr("Export the Long Profile"),
                                        .filters = ProfileTexts::tr("Pictures (*.png *.svg *.pdf)"),
                                        .proposal = m_branch + QStringLiteral(".png"),
                                        .extension = QStringLiteral(".png")},
                                       this);
    if (file.isEmpty())
        return;
    if (!PlotFileTypes.contains(QFileInfo(file).suffix().toLower())) {
        KsMessageBox(
            ProfileTexts::tr("A picture is saved as one of %1, and \"%2\" is named otherwise.")
                .arg(PlotFileTypes.join(QStringLiteral(", ")).toUpper(), KsVisibleText(QFileInfo(file).fileName())),
            QMessageBox::Ok, this);
        return;
    }
    if (const QString why = m_plot->Write(file, PictureWidth, PictureHeight); !why.isEmpty())
        KsMessageBox(ProfileTexts::tr("The picture could not be saved.\n%1").arg(why), QMessageBox::Ok, this);
}

void CProfilePanel::Print()
{
    m_plot->Print(this);
}

void CProfilePanel::CopyAll()
{
    auto* copied = new QMimeData;
    copied->setText(TableText());
    copied->setImageData(m_plot->Picture(PictureWidth, PictureHeight));
    QApplication::clipboard()->setMimeData(copied);
}

/// A line for each place, a column for each curve; a cell is empty where the curve has no point.
QString CProfilePanel::TableText() const
{
    std::vector<const PlotCurve*> curves;
    QStringList headers{m_profile.plot.axis};
    std::vector<double> places;
    for (std::size_t track = 0; track < m_profile.plot.tracks.size(); ++track)
        for (std::size_t i = 0; i < m_profile.plot.tracks[track].curves.size(); ++i) {
            const PlotCurve& curve = m_profile.plot.tracks[track].curves[i];
            if (!curve.end.empty() || !curve.hasPoints)
                continue;
            const QString& unit = m_profile.units[track][i];
            headers << (unit.isEmpty() ? curve.name : QStringLiteral("%1 [%2]").arg(curve.name, unit));
            curves.push_back(&curve);
            places.insert(places.end(), curve.x.begin(), curve.x.end());
        }
    std::ranges::sort(places);
    places.erase(std::unique(places.begin(), places.end()), places.end());
    QString text = headers.join(u'\t') + u'\n';
    std::vector<std::size_t> next(curves.size(), 0);
    for (const double x : places) {
        text += KsShortestNumber(x);
        for (std::size_t i = 0; i < curves.size(); ++i) {
            text += u'\t';
            const auto& at = curves[i]->x;
            if (next[i] < at.size() && at[next[i]] == x && std::isfinite(curves[i]->y[next[i]]))
                text += KsShortestNumber(curves[i]->y[next[i]]);
            while (next[i] < at.size() && at[next[i]] <= x)
                ++next[i];
        }
        text += u'\n';
    }
    return text;
}
