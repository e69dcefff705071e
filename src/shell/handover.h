// A further start of the program hands its files to the one that runs already.
#pragma once

#include <QObject>
#include <QStringList>
#include <functional>
#include <memory>

class QSocketNotifier;

/// Listens for the starts that come after this one: on a socket in the user's runtime folder, one for each display.
/// Only the user's own programs are heard, and what comes in is believed no further than a command line. Windows has no
/// such folder; there every start is a program of its own.
class CHandover : public QObject
{
public:
    /// Hands the files over, which are absolute paths. False when nobody has taken them: there is no program, it is
    /// busy with a question, or it does not answer within two seconds.
    static bool Give(const QStringList& files);

    /// What takes files; false when it cannot now. `token` lets it come to the front where the desktop wants one.
    using Taker = std::function<bool(const QStringList& files, const QString& token)>;
    /// Where another program listens already, or there is no runtime folder, nothing is heard.
    explicit CHandover(Taker take);
    ~CHandover() override;

private:
    void Accept();
    void Read(int connection);

    Taker m_take;
    int m_socket = -1;
    int m_connections = 0;
    std::unique_ptr<QSocketNotifier> m_listens;
};
