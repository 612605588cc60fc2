#pragma once

#include <QProcess>
#include <QStringList>

/// A test program started again as another process, for what must be seen from outside or may die.
///
/// main() of such a test asks isSecondLife() first and then runs the scene that the arguments name.
namespace SecondLife {

bool isSecondLife(int argc, char *argv[]);
/// The arguments that the test gave to start() or run().
QStringList arguments(int argc, char *argv[]);

/// Tells the test that a point of the scene is reached, and waits to be killed or told to go on.
void reportAndWait(const char *line);

/// Starts a scene. Killed with the object at the latest.
void start(QProcess &process, const QStringList &arguments);
/// Waits for a line on the scene's standard output.
bool waitForLine(QProcess &process, const QByteArray &line);

struct Outcome {
    bool exited = false; ///< false after a crash, or when it did not end in time
    int status = -1;
    QByteArray output;
};
/// Runs a scene to its end.
Outcome run(const QStringList &arguments, const QProcessEnvironment &environment = {});

} // namespace SecondLife
