#pragma once

#include <QAnimationDriver>

namespace headunit {

/**
 * The time of the scene's animations, which passes when it is told to.
 *
 * In a scenario the flow's time stands still between the commands; only so does the transcript
 * stay the same whatever the scene does. The animations run all the same: in a time of their own.
 */
class SceneClock : public QAnimationDriver
{
    Q_OBJECT

public:
    explicit SceneClock(QObject *parent = nullptr);
    ~SceneClock() override;

    /** Moves all animations on by one frame. */
    void tick();

    /** What a frame lasts, in milliseconds. */
    static int frameMs();

    qint64 elapsed() const override;

protected:
    void start() override;

private:
    Q_DISABLE_COPY(SceneClock)

    qint64 m_elapsed = 0;
};

} // namespace headunit
