#include "shell/handover.h"

#include <QFile>
#include <QTemporaryDir>
#include <QTest>
#include <gtest/gtest.h>
#include <optional>
#include <sys/socket.h>
#include <sys/un.h>
#include <thread>
#include <unistd.h>

namespace {

class Handover : public testing::Test
{
protected:
    Handover() { qputenv("XDG_RUNTIME_DIR", folder.path().toLocal8Bit()); }
    ~Handover() override { qputenv("XDG_RUNTIME_DIR", before); }

    void Listen()
    {
        listener.emplace([this](const QStringList& files, const QString&) {
            taken += files;
            return takes;
        });
    }
    /// What another program does, while this one answers.
    template <typename Action>
    static bool Elsewhere(Action action)
    {
        std::optional<bool> result;
        std::jthread other([&] {
            const bool done = action();
            QMetaObject::invokeMethod(qApp, [&result, done] { result = done; });
        });
        EXPECT_TRUE(QTest::qWaitFor([&] { return result.has_value(); }, 10000));
        return result.value_or(false);
    }
    bool Give(const QStringList& files) const
    {
        return Elsewhere([files] { return CHandover::Give(files); });
    }
    /// Sends a message as it stands; true when it was taken.
    bool Send(const QByteArray& message) const
    {
        return Elsewhere([this, message] {
            const QByteArray name = QFile::encodeName(folder.filePath(QDir(folder.path()).entryList(QDir::System)[0]));
            const int socket = ::socket(AF_UNIX, SOCK_SEQPACKET, 0);
            sockaddr_un address{.sun_family = AF_UNIX, .sun_path = {}};
            std::copy(name.begin(), name.end(), address.sun_path);
            char answer[16];
            const bool isTaken = ::connect(socket, reinterpret_cast<sockaddr*>(&address), sizeof address) == 0 &&
                                 ::send(socket, message.data(), std::size_t(message.size()), MSG_NOSIGNAL) > 0 &&
                                 ::recv(socket, answer, sizeof answer, 0) > 0;
            ::close(socket);
            return isTaken;
        });
    }

    QByteArray before = qgetenv("XDG_RUNTIME_DIR");
    QTemporaryDir folder;
    QStringList taken;
    bool takes = true;
    std::optional<CHandover> listener;
};

} // namespace

TEST_F(Handover, TheRunningProgramTakesFilesAsLongAsItLives)
{
    EXPECT_FALSE(Give({"/a.tst"})) << "nobody listens";
    Listen();
    EXPECT_TRUE(Give({"/a.tst", "/b c\n\u00e4.tst"}));
    EXPECT_EQ(taken, (QStringList{"/a.tst", "/b c\n\u00e4.tst"}));
    EXPECT_FALSE(Give({})) << "a start without files is one of its own";
    takes = false;
    EXPECT_FALSE(Give({"/a.tst"}));
    const CHandover second([](const QStringList&, const QString&) { return true; });
    EXPECT_FALSE(Give({"/a.tst"})) << "the first one is asked";
    listener.reset();
    EXPECT_FALSE(Give({"/a.tst"}));
}

TEST_F(Handover, WhatNoStartSendsDoesNothing)
{
    Listen();
    const QByteArray good("kvrshell 1\0\0/a.tst", 18);
    EXPECT_TRUE(Send(good));
    taken.clear();
    for (const QByteArray& message : {QByteArray("x"), good.chopped(7), QByteArray("kvrshell 1\0\0a.tst", 17),
                                      good + QByteArray(100000, 'x'), QByteArray(20, '\0')})
        EXPECT_FALSE(Send(message)) << message.left(30).constData();
    EXPECT_EQ(taken, QStringList());
    EXPECT_TRUE(Send(good)) << "and it still listens";
}

// A program that hangs does not keep the next one from starting; one that was killed leaves its socket.
TEST_F(Handover, NobodyWaitsForWhoDoesNotAnswer)
{
    Listen();
    QElapsedTimer timer;
    timer.start();
    EXPECT_FALSE(CHandover::Give({"/a.tst"})); // this thread does not answer meanwhile
    EXPECT_LT(timer.elapsed(), 5000);
    QTest::qWait(50);
    EXPECT_EQ(taken, QStringList()) << "who has gone starts by himself";
    const QString name = folder.filePath(QDir(folder.path()).entryList(QDir::System)[0]);
    EXPECT_EQ(QFile::permissions(name) & (QFile::ReadGroup | QFile::WriteGroup | QFile::ReadOther | QFile::WriteOther),
              QFile::Permissions());
}
