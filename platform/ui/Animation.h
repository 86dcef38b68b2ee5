#pragma once

#include <QObject>

#include <functional>

class QVariantAnimation;

namespace orvex {

// Whether slides and fades take time. If not, every transition has finished when start() returns.
bool animationsEnabled();
void setAnimationsEnabled(bool enabled);

// Runs one transition at a time, from 0 to 1, slowing down at the end.
class Transition : public QObject {
public:
    using Step = std::function<void(double progress)>;
    using End = std::function<void()>;

    explicit Transition(QObject* parent)
        : QObject(parent)
    {
    }

    // Calls the step with 0, values in between and 1, then the end. Finishes a running transition first.
    void start(int milliseconds, Step step, End end);
    // Jumps to the end of a running transition.
    void finish();
    bool isRunning() const { return static_cast<bool>(_end); }

private:
    void complete();

    QVariantAnimation* _clock = nullptr; // child
    Step _step;
    End _end;
};

} // namespace orvex
