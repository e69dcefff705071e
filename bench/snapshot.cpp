// How long the user-interface thread is held up when the changes of a large document are kept for recovery.
// bench_snapshot FILE, for example of examples/make_million.
#include "bench/report.h"
#include "shell/main_frame.h"

#include <QApplication>
#include <QStandardPaths>
#include <QTemporaryDir>
#include <QUndoCommand>
#include <QUndoStack>

namespace {

constexpr int Rounds = 15;
constexpr double Limit = 16; // milliseconds: one picture at 60 a second

/// Notes the longest event.
class Application : public QApplication
{
public:
    using QApplication::QApplication;
    bool notify(QObject* receiver, QEvent* event) override
    {
        bool handled = false;
        longest = std::max(longest, Milliseconds([&] { handled = QApplication::notify(receiver, event); }));
        return handled;
    }
    double longest = 0;
};

} // namespace

int main(int argc, char** argv)
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    QStandardPaths::setTestModeEnabled(true);
    const QTemporaryDir states;
    qputenv("XDG_STATE_HOME", states.path().toUtf8());
    Application app(argc, argv);
    CMainFrame frame;
    frame.LoadPlugins(QCoreApplication::applicationDirPath() + "/plugins");
    frame.Snapshots().SetDelay(std::chrono::milliseconds(0));
    frame.show();
    if (argc != 2 || !frame.OpenFile(QString::fromLocal8Bit(argv[1]))) {
        std::fprintf(stderr, "usage: bench_snapshot FILE\n");
        return 2;
    }
    CKsDoc& document = *frame.ActiveDocument();
    const CSnapshot& snapshot = *frame.Snapshots().Of(&document);
    for (int i = 0; i < 200; ++i) // the other pages are made
        QApplication::processEvents();
    std::vector<double> held, whole;
    for (int i = 0; i < Rounds; ++i) {
        document.UndoStack().push(new QUndoCommand("step"));
        document.SetModifiedFlag();
        app.longest = 0;
        whole.push_back(Milliseconds([&] {
            do
                QApplication::processEvents(QEventLoop::WaitForMoreEvents);
            while (!snapshot.IsWriting());
            while (snapshot.IsWriting())
                QApplication::processEvents(QEventLoop::WaitForMoreEvents);
        }));
        held.push_back(app.longest);
    }
    std::printf("until the file is complete: %.0f ms; longest of all: %.3f ms\n", Median(whole),
                *std::max_element(held.begin(), held.end()));
    document.UndoStack().setClean();
    return Report("Keeping the changes, on the user's time / a picture", Median(held), Limit, 1) ? 0 : 1;
}
