// kvrshell_drive SAMPLE_FOLDER OUT_FOLDER: copies the sample project, starts the shell on the copy, drives it through
// its main job and says what was done, what was verified and where the pictures are. Exit code 0 when everything held.
#include "drive/main_job.h"
#include "drive/project_job.h"
#include "drive/robot.h"
#include "ks/fc/message_box.h"
#include "shell/main_frame.h"
#include "shell/shell_main.h"

#include <QDir>
#include <QFile>
#include <QMdiSubWindow>
#include <QStandardPaths>
#include <QTest>
#include <QTimer>
#include <cstdio>
#include <cstdlib>

namespace {

bool CopySample(const QString& from, const QString& to)
{
    QDir(to).removeRecursively();
    if (!QDir().mkpath(to))
        return false;
    for (const QFileInfo& file : QDir(from).entryInfoList(QDir::Files)) {
        if (!QFile::copy(file.filePath(), QDir(to).filePath(file.fileName())))
            return false;
    }
    return true;
}

int Report(const Robot& robot)
{
    std::printf("\nPictures:\n");
    for (const QString& picture : robot.Pictures())
        std::printf("  %s\n", qPrintable(picture));
    std::printf("\n%d checks, %d failed\n", robot.Verified(), robot.Failures());
    return robot.Failures() == 0 ? 0 : 1;
}

} // namespace

int main(int argc, char** argv)
{
    if (argc != 3) {
        std::fprintf(stderr, "usage: kvrshell_drive SAMPLE_FOLDER OUT_FOLDER\n");
        return 2;
    }
    const QString sample = QString::fromLocal8Bit(argv[1]), out = QString::fromLocal8Bit(argv[2]);
    const QString work = out + "/project";
    if (!CopySample(sample, work)) {
        std::fprintf(stderr, "cannot copy %s to %s\n", argv[1], qPrintable(work));
        return 2;
    }
    QStandardPaths::setTestModeEnabled(true); // the user's settings and recent files stay as they are
    std::setvbuf(stdout, nullptr, _IOLBF, BUFSIZ);

    QByteArray project = QFile::encodeName(work + "/river.kvrp");
    char* arguments[] = {argv[0], project.data(), nullptr};
    int result = 1;
    // Nobody is there to press a button: an unexpected message ends the drive with its text.
    KsSetMessageBoxHandler([](const CString& text, QMessageBox::StandardButtons) {
        std::printf("FAILED: the program says: %s\n", qPrintable(text));
        std::exit(1);
        return QMessageBox::Ok;
    });
    std::printf("Driving the shell on %s\n", project.constData());
    ShellMain(2, arguments, [&](CMainFrame& frame) {
        QTimer::singleShot(0, &frame, [&] {
            frame.resize(1600, 1000); // whatever the size of the screen that is not there
            Robot robot(frame, out);
            constexpr int members = 3; // the first one is there, the others follow
            robot.Verify(QTest::qWaitFor([&] { return frame.findChildren<QMdiSubWindow*>().size() == members; }),
                         "the project opens all its files");
            robot.Choose("actionSideBySide");
            DriveMainJob(robot, work + "/river.HDKV");
            DriveProjectJob(robot);
            result = Report(robot);
            QCoreApplication::exit(result);
        });
    });
    return result;
}
