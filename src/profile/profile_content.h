// What the tables of a document say along one branch, as curves of a plot.
#pragma once

#include "plot/plot.h"
#include "profile/profile_host.h"

#include <QSet>

/// Where the points of a curve come from.
struct ProfileCurve
{
    int table = -1;                  // of Profile::tables; -1 for a curve that nothing of the document gives
    int column = -1;                 // of the value, from 0
    std::vector<std::size_t> rows{}; // of the table's source, a point each
    bool isDepth = false;            // what is shown is the value above the bed
};

/// A track that can be shown.
struct ProfileTrack
{
    QString key; // the same in every language, and for every document
    QString title;
};

struct Profile
{
    QString branch; // key of its name
    std::vector<ProfileTable> tables;
    PlotContent plot;
    std::vector<std::vector<ProfileCurve>> curves; // as those of the plot's tracks
    std::vector<std::vector<QString>> units;       // likewise: of the values
    std::vector<ProfileTrack> tracks;              // all there are, shown or not
    std::function<double(double x)> bedAt;         // the ground between cross sections, in the units shown; NaN outside

    const ProfileCurve& At(const PlotPoint& point) const
    {
        return curves[std::size_t(point.track)][std::size_t(point.curve)];
    }
    /// The points of a line.
    std::vector<PlotPoint> PointsOf(int table, std::size_t row) const;
};

inline const QString LevelsTrack = QStringLiteral("levels"), ReachesTrack = QStringLiteral("reaches");

/// The branches that tables and network name: keys of their names, in the order of the alphabet.
QStringList ProfileBranchesOf(IProfileHost& host);

/// With the tracks whose keys are in `shown`, and those of the page in front.
Profile MakeProfile(IProfileHost& host, const QString& branch, const QSet<QString>& shown);
