#pragma once

#include "Range.h"

#include "Program.h"

#include <QElapsedTimer>

#include <optional>

namespace orvex::soak {

// What a koratd plays.
struct Scene {
    QString technology;
    std::optional<int> rate; // messages a second; none: the scenario's own pace
    std::optional<unsigned> seed;
    QStringList more; // options

    QStringList arguments() const;
    // "MRL_LTE 200/s --fault garbage=20"
    std::string text() const;
};

// A koratd that serves, and what is known of how many messages it has sent.
class ServiceProgram {
public:
    ServiceProgram(const test::ProgramFolder& folder, const Scene& scene);

    // Asks it to end, or waits until it ends of itself. What it says that it has sent.
    Range terminate();
    Range waitForDeath();
    // Kills it. It is asked to record what it sends, and sends at a rate: the recording on disk is the least
    // that it can have sent, the rate allows the most.
    Range kill();

    test::Program& program() { return _program; }

private:
    Range sent() const;

    std::string _recording;
    Scene _scene;
    QElapsedTimer _life;
    test::Program _program;
};

} // namespace orvex::soak
