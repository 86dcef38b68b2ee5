#pragma once

#include <QObject>

#include <functional>

class QVariantAnimation;

namespace orvex {

// Whether slides and fades take time. Switched off, every transition is finished when the call that starts
// it returns.
bool animationsEnabled();
void setAnimationsEnabled(bool enabled);

// One transition at a time, from 0 to 1 with a soft landing.
class Transition : public QObject {
public:
    using Step = std::function<void(double progress)>;
    using End = std::function<void()>;

    explicit Transition(QObject* parent)
        : QObject(parent)
    {
    }

    // Runs the step with 0, on the way, and with 1, then the end. A transition still running is finished
    // first.
    void start(int milliseconds, Step step, End end);
    // Jumps to the end. Nothing happens when nothing is running.
    void finish();
    bool isRunning() const { return static_cast<bool>(_end); }

private:
    void complete();

    QVariantAnimation* _clock = nullptr; // child
    Step _step;
    End _end;
};

} // namespace orvex
