#include "ks/fc/after_paint.h"

#include <QEvent>
#include <QTimer>
#include <QWidget>
#include <utility>

namespace {

class AfterPaint : public QObject
{
public:
    AfterPaint(QWidget* painted, QObject* owner, std::function<void()> action)
        : QObject(owner), m_action(std::move(action))
    {
        constexpr int patience = 500; // milliseconds
        QTimer::singleShot(patience, this, &AfterPaint::Run);
        painted->installEventFilter(this);
    }

    bool eventFilter(QObject*, QEvent* event) override
    {
        if (event->type() == QEvent::Paint)
            QTimer::singleShot(0, this, &AfterPaint::Run);
        return false;
    }

private:
    void Run()
    {
        if (const auto action = std::exchange(m_action, nullptr)) {
            deleteLater();
            action();
        }
    }

    std::function<void()> m_action;
};

} // namespace

void KsAfterPaint(QWidget* painted, QObject* owner, std::function<void()> action)
{
    new AfterPaint(painted, owner, std::move(action));
}
