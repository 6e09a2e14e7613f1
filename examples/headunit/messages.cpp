#include "messages.h"

#include <QLoggingCategory>
#include <QString>

#include <cstring>

namespace headunit {

namespace {

QtMessageHandler previousHandler = nullptr;

bool isPopupTrace(const QMessageLogContext &context, const QString &text)
{
    return context.category && std::strcmp(context.category, "vosk.hmistatemachine") == 0
        && text.startsWith("virtual void HmiStateMachine::PopupState::showPopup(bool)");
}

void handleMessage(QtMsgType type, const QMessageLogContext &context, const QString &text)
{
    if (!isPopupTrace(context, text)) {
        previousHandler(type, context, text);
    }
}

} // namespace

void hidePopupTraces()
{
    previousHandler = qInstallMessageHandler(handleMessage);
}

} // namespace headunit
