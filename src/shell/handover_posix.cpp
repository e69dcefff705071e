#include "shell/handover.h"

#include <QDir>
#include <QFile>
#include <QRegularExpression>
#include <QSocketNotifier>
#include <QTimer>
#include <algorithm>
#include <cerrno>
#include <cstring>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/time.h>
#include <sys/un.h>
#include <unistd.h>
#include <utility>

namespace {

constexpr int Patience = 2;                // seconds
constexpr std::size_t Longest = 64 * 1024; // of a message
constexpr int MostConnections = 8;
const QByteArray Greeting = "kvrshell 1", Taken = "taken";

/// Empty without a runtime folder, or when the path is too long for a socket.
QByteArray SocketName()
{
    const QString folder = qEnvironmentVariable("XDG_RUNTIME_DIR");
    QString display = qEnvironmentVariable("WAYLAND_DISPLAY", qEnvironmentVariable("DISPLAY"));
    display.replace(QRegularExpression(QStringLiteral("[^A-Za-z0-9.-]")), QStringLiteral("_"));
    const QByteArray name = QFile::encodeName(folder + QStringLiteral("/kvrshell-") + display);
    return QDir::isAbsolutePath(folder) && name.size() < qsizetype(sizeof(sockaddr_un::sun_path)) ? name : QByteArray();
}

int NewSocket(int flags = 0)
{
    return ::socket(AF_UNIX, SOCK_SEQPACKET | SOCK_CLOEXEC | flags, 0); // a message comes whole
}

/// connect or bind.
bool AtName(int (*call)(int, const sockaddr*, socklen_t), int socket, const QByteArray& name)
{
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    std::memcpy(address.sun_path, name.constData(), std::size_t(name.size()));
    return call(socket, reinterpret_cast<const sockaddr*>(&address), sizeof address) == 0;
}

/// One that nobody listens at: a program that has died leaves it. Other things of that name are left alone.
bool IsLeftOver(const QByteArray& name)
{
    struct stat status;
    const int socket = NewSocket(SOCK_NONBLOCK); // a program that hangs has many who wait to be taken
    const bool isLeft = ::lstat(name.constData(), &status) == 0 && S_ISSOCK(status.st_mode) &&
                        !AtName(&::connect, socket, name) && errno == ECONNREFUSED;
    ::close(socket);
    return isLeft;
}

bool IsOwnUser(int connection)
{
    ucred peer{};
    socklen_t size = sizeof peer;
    return ::getsockopt(connection, SOL_SOCKET, SO_PEERCRED, &peer, &size) == 0 && peer.uid == ::getuid();
}

/// The greeting, the token and the paths, with a zero between them.
QByteArray MessageOf(const QStringList& files)
{
    const QString token = qEnvironmentVariable("XDG_ACTIVATION_TOKEN", qEnvironmentVariable("DESKTOP_STARTUP_ID"));
    QByteArrayList parts{Greeting, token.toUtf8()};
    for (const QString& file : files)
        parts << QFile::encodeName(file);
    return parts.join('\0');
}

bool Exchange(int socket, const QByteArray& name, const QByteArray& message)
{
    const timeval patience{.tv_sec = Patience, .tv_usec = 0}; // for a program that hangs
    ::setsockopt(socket, SOL_SOCKET, SO_SNDTIMEO, &patience, sizeof patience);
    ::setsockopt(socket, SOL_SOCKET, SO_RCVTIMEO, &patience, sizeof patience);
    if (!AtName(&::connect, socket, name) || !IsOwnUser(socket) ||
        ::send(socket, message.constData(), std::size_t(message.size()), MSG_NOSIGNAL) != message.size())
        return false;
    char answer[16];
    const ssize_t size = ::recv(socket, answer, sizeof answer, 0);
    return size == Taken.size() && std::equal(Taken.begin(), Taken.end(), answer);
}

} // namespace

bool CHandover::Give(const QStringList& files)
{
    const QByteArray name = SocketName(), message = MessageOf(files);
    const int socket = name.isEmpty() || files.isEmpty() || message.size() > qsizetype(Longest) ? -1 : NewSocket();
    const bool isTaken = socket != -1 && Exchange(socket, name, message);
    if (socket != -1)
        ::close(socket);
    return isTaken;
}

CHandover::CHandover(Taker take) : m_take(std::move(take))
{
    const QByteArray name = SocketName();
    m_socket = name.isEmpty() ? -1 : NewSocket();
    if (m_socket == -1)
        return;
    const mode_t mask = ::umask(0177);
    bool isBound = AtName(&::bind, m_socket, name);
    if (!isBound && errno == EADDRINUSE && IsLeftOver(name)) {
        ::unlink(name.constData());
        isBound = AtName(&::bind, m_socket, name);
    }
    ::umask(mask);
    if (!isBound || ::listen(m_socket, MostConnections) != 0) {
        ::close(std::exchange(m_socket, -1));
        return;
    }
    m_listens = std::make_unique<QSocketNotifier>(m_socket, QSocketNotifier::Read);
    connect(m_listens.get(), &QSocketNotifier::activated, this, [this] { Accept(); });
}

CHandover::~CHandover()
{
    if (m_socket == -1)
        return;
    ::unlink(SocketName().constData());
    m_listens.reset();
    ::close(m_socket);
}

void CHandover::Accept()
{
    const int connection = ::accept4(m_socket, nullptr, nullptr, SOCK_CLOEXEC | SOCK_NONBLOCK);
    if (connection == -1)
        return;
    if (m_connections == MostConnections || !IsOwnUser(connection)) {
        ::close(connection);
        return;
    }
    ++m_connections;
    auto* speaks = new QSocketNotifier(connection, QSocketNotifier::Read, this);
    connect(speaks, &QObject::destroyed, this, [this, connection] {
        ::close(connection);
        --m_connections;
    });
    connect(speaks, &QSocketNotifier::activated, this, [this, speaks, connection] {
        speaks->setEnabled(false);
        Read(connection);
        speaks->deleteLater();
    });
    QTimer::singleShot(1000 * Patience, speaks, &QObject::deleteLater); // one that says nothing
}

void CHandover::Read(int connection)
{
    QByteArray message(qsizetype(Longest), Qt::Uninitialized);
    const ssize_t size = ::recv(connection, message.data(), Longest, MSG_TRUNC);
    if (size <= 0 || std::size_t(size) > Longest)
        return;
    message.truncate(size);
    QByteArrayList parts = message.split('\0');
    if (parts.size() < 3 || parts.takeFirst() != Greeting)
        return;
    const QString token = QString::fromUtf8(parts.takeFirst());
    QStringList files;
    for (const QByteArray& part : parts)
        files << QFile::decodeName(part);
    const bool arePaths = std::all_of(files.begin(), files.end(), &QDir::isAbsolutePath);
    // Whoever has waited too long has started by himself, and is read as an end.
    char rest = 0;
    const bool waits = ::recv(connection, &rest, 1, MSG_PEEK) == -1;
    if (arePaths && waits && m_take(files, token))
        ::send(connection, Taken.constData(), std::size_t(Taken.size()), MSG_NOSIGNAL);
}
