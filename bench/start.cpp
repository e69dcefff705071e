// From the start of the process to the painted first page of the sample project, against a bare program that shows a
// document window with as many empty tabs. bench_start SAMPLE_PROJECT; each start is a process of its own.
#include "bench/report.h"
#include "shell/main_frame.h"
#include "shell/shell_main.h"

#include <QApplication>
#include <QMdiArea>
#include <QMdiSubWindow>
#include <QProcess>
#include <QStandardPaths>
#include <QTabWidget>
#include <cstring>

namespace {

enum
{
    NotOnSheet
};
#define KVR_PAGE(name, caption, tab, offersBranchNames) +(tab != NotOnSheet)
constexpr int Tabs =
#include "src/pages/page_list.inc"
    ;
#undef KVR_PAGE
constexpr int Rounds = 31;

int RunShell(int argc, char** argv)
{
    QStandardPaths::setTestModeEnabled(true);
    return ShellMain(argc, argv, [](CMainFrame& frame) {
        frame.repaint();
        std::exit(frame.GetActiveView() ? 0 : 1); // ending the program is not what is measured
    });
}

int RunBare(int argc, char** argv)
{
    QApplication app(argc, argv);
    QMainWindow frame;
    auto* area = new QMdiArea;
    frame.setCentralWidget(area);
    auto* tabs = new QTabWidget;
    for (int i = 0; i < Tabs; ++i)
        tabs->addTab(new QWidget, QString::number(i + 1));
    area->addSubWindow(tabs)->showMaximized();
    frame.resize(1000, 760);
    frame.show();
    QApplication::processEvents();
    frame.repaint();
    std::exit(0);
}

double Start(const QStringList& arguments)
{
    return Milliseconds([&] {
        if (QProcess::execute(QCoreApplication::applicationFilePath(), arguments) != 0) {
            std::fprintf(stderr, "a started program failed: %s\n", qPrintable(arguments.join(' ')));
            std::exit(2);
        }
    });
}

} // namespace

int main(int argc, char** argv)
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    if (argc == 2 && std::strcmp(argv[1], "--bare") == 0)
        return RunBare(argc, argv);
    if (argc == 3 && std::strcmp(argv[1], "--shell") == 0) {
        char separate[] = "--separate";
        char* arguments[] = {argv[0], separate, argv[2], nullptr};
        return RunShell(3, arguments);
    }
    if (argc != 2) {
        std::fprintf(stderr, "usage: bench_start SAMPLE_PROJECT\n");
        return 2;
    }
    QCoreApplication app(argc, argv);
    const QString project = QString::fromLocal8Bit(argv[1]);
    std::vector<double> shell, bare;
    for (int i = -2; i < Rounds; ++i) { // the first two warm up
        const double first = Start({"--shell", project}), second = Start({"--bare"});
        if (i >= 0) {
            shell.push_back(first);
            bare.push_back(second);
        }
    }
    return Report("Start to the first page / bare program with as many tabs", Median(shell), Median(bare), 1.5) ? 0 : 1;
}
