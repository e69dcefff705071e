// How long the user-interface thread is held up when the changes of a large document are kept for recovery, and when
// its file is read again because somebody has touched it. bench_snapshot FILE, for example of examples/make_million.
#include "bench/report.h"
#include "shell/main_frame.h"

#include <QApplication>
#include <QElapsedTimer>
#include <QStandardPaths>
#include <QTemporaryDir>
#include <QUndoCommand>
#include <QUndoStack>
#include <ctime>
#include <filesystem>
#include <utility>

namespace {

constexpr int Rounds = 15;
constexpr double Limit = 16;   // milliseconds: one picture at 60 a second
constexpr int UntilRead = 800; // milliseconds, from a touch until the file has been read

/// What the thread has computed so far: of a busy machine this tells more than the clock.
double ComputedMilliseconds()
{
#ifdef CLOCK_THREAD_CPUTIME_ID
    timespec time{};
    clock_gettime(CLOCK_THREAD_CPUTIME_ID, &time);
    return double(time.tv_sec) * 1e3 + double(time.tv_nsec) / 1e6;
#else
    return 0;
#endif
}

/// Notes how long each event takes.
class Application : public QApplication
{
public:
    using QApplication::QApplication;
    bool notify(QObject* receiver, QEvent* event) override
    {
        bool handled = false;
        const bool isInner = std::exchange(m_isInEvent, true);
        const double computed = ComputedMilliseconds();
        const double time = Milliseconds([&] { handled = QApplication::notify(receiver, event); });
        m_isInEvent = isInner;
        if (isInner)
            return handled;
        events.push_back(time);
        longestComputed = std::max(longestComputed, ComputedMilliseconds() - computed);
        return handled;
    }
    std::vector<double> events;
    double longestComputed = 0;

private:
    bool m_isInEvent = false;
};

/// Runs `step` again and again and tells what it cost; false when half of the times an event took too long.
bool Measure(const char* what, Application& app, const std::function<void()>& step)
{
    std::vector<double> longest, all, computed;
    for (int i = 0; i < Rounds; ++i) {
        app.events.clear();
        app.longestComputed = 0;
        step();
        computed.push_back(app.longestComputed);
        longest.push_back(*std::ranges::max_element(app.events));
        all.insert(all.end(), app.events.begin(), app.events.end());
    }
    std::ranges::sort(all);
    std::printf("%zu events, 99.9 %% of them within %.3f ms, longest of all: %.3f ms\n", all.size(),
                all[all.size() * 999 / 1000], all.back());
    std::printf("of the longest computed by the thread itself: %.3f ms, at most %.3f ms\n", Median(computed),
                *std::ranges::max_element(computed));
    return Report(what, Median(longest), Limit, 1);
}

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
    std::vector<double> whole;
    const bool keeps = Measure("Keeping the changes, on the user's time / a picture", app, [&] {
        document.UndoStack().push(new QUndoCommand("step"));
        document.SetModifiedFlag();
        whole.push_back(Milliseconds([&] {
            do
                QApplication::processEvents(QEventLoop::WaitForMoreEvents);
            while (!snapshot.IsWriting());
            while (snapshot.IsWriting())
                QApplication::processEvents(QEventLoop::WaitForMoreEvents);
        }));
    });
    std::printf("until the file is complete: %.0f ms\n", Median(whole));
    document.UndoStack().setClean();
    const bool looks = Measure("Reading a touched file, on the user's time / a picture", app, [&] {
        std::filesystem::last_write_time(argv[1], std::filesystem::file_time_type::clock::now());
        QElapsedTimer timer;
        timer.start();
        while (timer.elapsed() < UntilRead)
            QApplication::processEvents(QEventLoop::AllEvents, 10);
    });
    return keeps && looks ? 0 : 1;
}
