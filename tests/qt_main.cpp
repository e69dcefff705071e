// The main of every test program that needs Qt: an application on the offscreen platform, the C
// locale kept for numbers as in the shell, and settings and what is kept for recovery away from the user's own and from
// those of the tests that run at the same time.
#include <QApplication>
#include <QSettings>
#include <QStandardPaths>
#include <QTemporaryDir>
#include <gtest/gtest.h>

int main(int argc, char** argv)
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    QStandardPaths::setTestModeEnabled(true);
    QCoreApplication::setOrganizationName("KVR-test");
    QCoreApplication::setApplicationName("kvr-tests");
    const QTemporaryDir settings;
    QSettings::setPath(QSettings::NativeFormat, QSettings::UserScope, settings.path());
    qputenv("XDG_STATE_HOME", settings.filePath("state").toUtf8());
    testing::InitGoogleTest(&argc, argv);
    QApplication app(argc, argv);
    return RUN_ALL_TESTS();
}
