#include "Animation.h"

#include <QEasingCurve>
#include <QVariantAnimation>

#include <utility>

namespace orvex {

namespace {
bool& enabledFlag()
{
    static bool enabled = true;
    return enabled;
}
} // namespace

bool animationsEnabled()
{
    return enabledFlag();
}

void setAnimationsEnabled(bool enabled)
{
    enabledFlag() = enabled;
}

void Transition::start(int milliseconds, Step step, End end)
{
    finish();
    _step = std::move(step);
    _end = std::move(end);
    if (!animationsEnabled())
        return complete();
    if (!_clock) {
        _clock = new QVariantAnimation(this);
        _clock->setStartValue(0.0);
        _clock->setEndValue(1.0);
        _clock->setEasingCurve(QEasingCurve::OutCubic);
        connect(_clock, &QVariantAnimation::valueChanged, this, [this](const QVariant& progress) {
            if (_step)
                _step(progress.toDouble());
        });
        connect(_clock, &QVariantAnimation::finished, this, [this] { complete(); });
    }
    _step(0.0);
    _clock->setDuration(milliseconds);
    _clock->start();
}

void Transition::finish()
{
    if (!isRunning())
        return;
    if (_clock)
        _clock->stop();
    complete();
}

void Transition::complete()
{
    // The end may start the next transition.
    const Step step = std::exchange(_step, nullptr);
    const End end = std::exchange(_end, nullptr);
    if (step)
        step(1.0);
    if (end)
        end();
}

} // namespace orvex
