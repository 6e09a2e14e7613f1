#include "commands.h"

#include "arguments.h"
#include "checks.h"
#include "flow/voice.h"
#include "hardkeys.h"
#include "transcript.h"
#include "vehicle.h"
#include "viewlayer.h"
#include "vocabulary.h"

#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/named/statemachine.h>
#include <HmiStateMachine/popup/popupdismisstransition.h>

#include <QEventLoop>
#include <QTimer>

using namespace HmiStateMachine;

namespace headunit {

namespace {

constexpr int maximumDepth = 255;
constexpr int maximumBurst = 1000;
constexpr int maximumWaitMs = 10000;

const QString anyPopup = QStringLiteral("any");

std::optional<Fault> post(QEvent *event)
{
    StateMachine::instance()->postEvent(event);
    return std::nullopt;
}

Action viewAction(const QString &id, Arguments &arguments)
{
    const QVariant data = arguments.optionalData();
    return [id, data](Stage &) { return post(new HmiViewEvent(id, data)); };
}

Action backAction(int depth, const QString &target)
{
    return [depth, target](Stage &) {
        return post(new HmiBackEvent(static_cast<unsigned char>(depth), target));
    };
}

Action parseView(Arguments &arguments)
{
    const QString id = arguments.name("the name of a view or a domain", requestableNames());
    return viewAction(id, arguments);
}

Action parseBack(Arguments &arguments)
{
    const int depth = arguments.atEnd() ? 1 : arguments.number("a depth", 0, maximumDepth);
    const QString target =
        arguments.atEnd() ? QString() : arguments.name("the name of a view", viewStateNames());
    return backAction(depth, target);
}

// The same requests with names that nobody has checked.
Action parseTry(Arguments &arguments)
{
    const QString request = arguments.name("a request to try", {"view", "back"});
    if (request == "back") {
        const int depth = arguments.number("a depth", 0, maximumDepth);
        return backAction(depth, arguments.word("a name, which need not exist"));
    }
    const QString id = arguments.word("a name, which need not exist");
    return viewAction(id, arguments);
}

Action parseKey(Arguments &arguments)
{
    const int key = HardKeys::fromName(arguments.name("the name of a key", keyNames()));
    const int status = arguments.number("a key status", HardKeys::Released, HardKeys::Held);
    return [key, status](Stage &stage) -> std::optional<Fault> {
        Q_EMIT stage.keys->keyChanged(key, status);
        return std::nullopt;
    };
}

Action parseSet(Arguments &arguments)
{
    const QString name = arguments.name("the name of a property", propertyNames());
    const QString property = name.section('.', 1);
    const QVariant value = arguments.data("a value");
    if (!arguments.fault() && !Vehicle::accepts(property, value)) {
        arguments.fail({Vehicle::valuesOf(property), arguments.echo().section(' ', 2), QString()});
    }
    return [property, value](Stage &stage) -> std::optional<Fault> {
        stage.vehicle->setProperty(qPrintable(property), value);
        return std::nullopt;
    };
}

Action parseEvent(Arguments &arguments)
{
    const QString name = arguments.word("the name of an event");
    const QVariant data = arguments.optionalData();
    return [name, data](Stage &) { return post(new HmiEvent(name, data)); };
}

Action parseVoice(Arguments &arguments)
{
    const QString phrase = arguments.name("a phrase", voicePhrases());
    const QVariant data = arguments.optionalData();
    return [phrase, data](Stage &) { return post(new HmiEvent(voiceEvent(phrase), data)); };
}

Action parsePopup(Arguments &arguments)
{
    const QString name = arguments.name("the name of a popup", popupNames());
    const QVariant data = arguments.optionalData();
    return [name, data](Stage &) { return post(new PopupEvent(name, data)); };
}

Action parseDismiss(Arguments &arguments)
{
    const QString name = arguments.name("the name of a popup or any", popupNames() << anyPopup);
    const QString target = name == anyPopup ? PopupDismissTransition::dismissEventWildCard
                                            : name + PopupDismissTransition::dismissEventSigniture;
    return [target](Stage &) { return post(new PopupEvent(target, QVariant())); };
}

// All requests are posted before the first of them is carried out.
Action parseBurst(Arguments &arguments)
{
    const int requests = arguments.number("a number of requests", 1, maximumBurst);
    const QStringList names = arguments.names("the names of popups", popupNames());
    return [requests, names](Stage &) -> std::optional<Fault> {
        for (int i = 0; i < requests; ++i) {
            post(new PopupEvent(names[i % names.size()], QVariantMap{{"number", i + 1}}));
        }
        return std::nullopt;
    };
}

Action parseDomain(Arguments &arguments)
{
    const QString name = arguments.name("the name of a domain", ViewLayer::domainNames());
    return [name](Stage &stage) -> std::optional<Fault> {
        stage.viewLayer->setActiveDomain(name);
        return std::nullopt;
    };
}

// The one place where time passes: timers of the flow run out here and nowhere else.
Action parseWait(Arguments &arguments)
{
    const int milliseconds = arguments.number("milliseconds", 0, maximumWaitMs);
    return [milliseconds](Stage &) -> std::optional<Fault> {
        QEventLoop loop;
        QTimer::singleShot(milliseconds, Qt::PreciseTimer, &loop, &QEventLoop::quit);
        loop.exec();
        return std::nullopt;
    };
}

Action parseSay(Arguments &arguments)
{
    const QString text = arguments.text("a text");
    return [text](Stage &stage) -> std::optional<Fault> {
        stage.transcript->narration(text);
        return std::nullopt;
    };
}

} // namespace

bool isStep(CommandKind kind)
{
    return kind == CommandKind::Step || kind == CommandKind::Wait;
}

const QList<CommandDefinition> &commandDefinitions()
{
    static const QList<CommandDefinition> definitions{
        {"view", "view NAME [JSON]", "request a view, or the first view of a domain",
         CommandKind::Step, parseView},
        {"back", "back [DEPTH [VIEW]]", "press back, DEPTH steps, on towards VIEW",
         CommandKind::Step, parseBack},
        {"key", "key NAME STATUS", "a key: 0 released, 1 pressed, 2 held", CommandKind::Step,
         parseKey},
        {"set", "set vehicle.PROPERTY JSON", "change a property of the vehicle", CommandKind::Step,
         parseSet},
        {"event", "event NAME [JSON]", "raise an event", CommandKind::Step, parseEvent},
        {"voice", "voice PHRASE [JSON]", "a phrase that the driver has spoken", CommandKind::Step,
         parseVoice},
        {"popup", "popup NAME [JSON]", "request a popup", CommandKind::Step, parsePopup},
        {"dismiss", "dismiss NAME | dismiss any", "dismiss a popup, or whichever are in front",
         CommandKind::Step, parseDismiss},
        {"burst", "burst NUMBER NAME...", "so many requests for these popups in turn, all at once",
         CommandKind::Step, parseBurst},
        {"domain", "domain NAME", "another domain takes over, without a change of view",
         CommandKind::Step, parseDomain},
        {"wait", "wait MILLISECONDS", "let time pass", CommandKind::Wait, parseWait},
        {"try", "try view NAME [JSON] | try back DEPTH NAME",
         "a request with a name that need not exist", CommandKind::Step, parseTry},
        {"expect", expectUsage, "stop unless all is as expected", CommandKind::Check, parseExpect},
        {"say", "say TEXT", "tell the reader something; also #! TEXT", CommandKind::Narration,
         parseSay},
    };
    return definitions;
}

QString commandHelp()
{
    QString text;
    for (const CommandDefinition &definition : commandDefinitions()) {
        text += QString("  %1\n      %2\n").arg(definition.usage, definition.help);
    }
    return text;
}

} // namespace headunit
