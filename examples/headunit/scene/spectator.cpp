#include "spectator.h"

#include "inspector.h"
#include "scenario/scenarioparser.h"
#include "scene.h"

#include <HmiStateMachine/named/statemachine.h>

#include <QDir>
#include <QRegularExpression>
#include <QThread>

namespace headunit {

namespace {

constexpr int maximumName = 40;

// "017-set-vehicle.gear-R.png"
QString fileName(int number, const QString &step)
{
    static const QRegularExpression unwanted("[^A-Za-z0-9.]+");
    QString text = step;
    text.replace(unwanted, "-");
    while (text.endsWith('-')) {
        text.chop(1);
    }
    return QString("%1-%2.png").arg(number, 3, 10, QChar('0')).arg(text.left(maximumName));
}

} // namespace

Spectator::Spectator(Scene *scene, Inspector *inspector, QObject *viewLayer, const Options &options)
    : m_scene(scene), m_inspector(inspector), m_options(options),
      m_pause({HmiStateMachine::StateMachine::instance(), viewLayer})
{
}

void Spectator::commandBegins(const Command &command)
{
    m_pause.end();
    if (isStep(command.kind)) {
        m_inspector->begin(command.echo);
    }
}

std::optional<Fault> Spectator::settle()
{
    return m_scene->settle(m_options.paceMs > 0);
}

std::optional<Fault> Spectator::commandEnds(const Command &command)
{
    if (command.kind == CommandKind::Wait) {
        m_pause.begin();
    } else {
        m_pause.beginAgain();
    }
    if (!isStep(command.kind)) {
        return std::nullopt;
    }
    m_inspector->update();
    m_scene->draw();
    if (!m_options.folder.isEmpty()) {
        if (const auto fault = takePicture(command.echo)) {
            return fault;
        }
    }
    QThread::msleep(static_cast<unsigned long>(m_options.paceMs));
    return std::nullopt;
}

std::optional<Fault> Spectator::takePicture(const QString &step)
{
    const QString path = QDir(m_options.folder).filePath(fileName(++m_pictures, step));
    if (!m_scene->picture().save(path)) {
        return Fault{"to write the picture " + quoted(path), "an error of the file",
                     "look whether the folder can be written to and the disk is full"};
    }
    m_options.taken(step, path);
    return std::nullopt;
}

} // namespace headunit
