// The problems of one document, found between the events of its user.
#pragma once

#include "problems/problem_host.h"

#include <QObject>
#include <QTimer>
#include <vector>

class CHDCheck;

class CProblemCheck : public QObject
{
    Q_OBJECT
public:
    /// The host outlives it.
    explicit CProblemCheck(IProblemHost& host, QObject* parent = nullptr);
    ~CProblemCheck() override;

    IProblemHost& Host() const { return m_host; }
    /// As of the last check that came to its end, in the order of the file.
    const std::vector<Problem>& Found() const { return m_found; }
    const std::vector<FileProblem>& OfFile() const { return m_ofFile; }
    /// Whether that is what there is now: no change has come since.
    bool IsCurrent() const { return m_isCurrent; }
    /// How many places break rules of a severity, with those that are not listed.
    std::size_t Count(Severity severity) const;

    /// The document has changed, or has come: it is checked afresh, once it has been left alone for a moment.
    void Restart();
    /// Its project has another network, or none any more.
    void RiverChanged();

signals:
    void Changed();
    /// Its end is near; what it found is still there.
    void Ends();

private:
    template <typename Work>
    void Try(const Work& work);
    void Begin();
    void GoOn();
    void Finish();

    IProblemHost& m_host;
    QTimer m_pause, m_slice;
    std::shared_ptr<const CRiver> m_river;
    bool m_knowsRiver = false;
    bool m_isCurrent = false;
    std::unique_ptr<CHDCheck> m_check; // the one under way
    std::vector<Problem> m_found;
    std::vector<FileProblem> m_ofFile;
    std::vector<std::size_t> m_counts; // by rule
};
