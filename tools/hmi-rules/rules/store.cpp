#include "store.h"

#include <HmiStateMachine/named/viewstatetarget.h>

#include <QDir>
#include <QHash>
#include <QLoggingCategory>
#include <QTemporaryFile>

#include <stdexcept>

using namespace HmiStateMachine;

namespace hmirules {

namespace {

constexpr char libraryCategory[] = "vosk.hmistatemachine";

/** Stands in for the application's view layer, which knows the numbers of domains. */
class DomainNumbers : public ViewStateTarget
{
public:
    int domainFromName(const QString &name) override
    {
        const auto known = m_numbers.constFind(name);
        return known == m_numbers.constEnd() ? *m_numbers.insert(name, m_numbers.size()) : *known;
    }
    void activateView(const QString &, const QVariant &) override { }
    void deactivateView(const QString &, const QVariant &) override { }
    void preparePopup(const QString &, bool) override { }
    void requestPopupShow(const QString &, int, const QVariant &) override { }
    void requestPopupHide(const QString &, bool) override { }
    void retryBlockedPopup(PopupState *) override { }
    void releaseBlockedPopups(const QMap<PopupState *, QTime> &) override { }
    void updatePopupData(const QString &, const QVariant &) override { }
    void setScreenPopupBehavior(bool) override { }
    void resetScreenPopupBehavior() override { }
    void postFollowOnBackEvent(quint8, const QString &, const QString &) override { }
    int activeDomain() const override { return -1; }
    Identifier activeView() const override { return Identifier(); }

private:
    QHash<QString, int> m_numbers;
};

DomainNumbers &domainNumbers()
{
    static DomainNumbers numbers;
    return numbers;
}

/** While it lives, the library's warnings are collected instead of written. */
class Listener
{
public:
    Listener()
    {
        s_messages.clear();
        m_filter = QLoggingCategory::installFilter(enableWarnings);
        m_handler = qInstallMessageHandler(collect);
    }
    ~Listener()
    {
        qInstallMessageHandler(m_handler);
        QLoggingCategory::installFilter(m_filter);
    }

    QStringList take()
    {
        QStringList messages;
        messages.swap(s_messages);
        return messages;
    }

private:
    Q_DISABLE_COPY(Listener)

    // Whatever the rules of logging are where this runs, no warning may be missed.
    static void enableWarnings(QLoggingCategory *category)
    {
        category->setEnabled(QtDebugMsg, false);
        category->setEnabled(QtWarningMsg, true);
    }

    static void collect(QtMsgType, const QMessageLogContext &context, const QString &message)
    {
        if (qstrcmp(context.category, libraryCategory) == 0) {
            s_messages.append(message);
        }
    }

    static QStringList s_messages;
    QLoggingCategory::CategoryFilter m_filter;
    QtMessageHandler m_handler;
};

QStringList Listener::s_messages;

// Of a folder that is not there QTemporaryFile makes the root folder.
QString temporaryFolder()
{
    const QString named = qEnvironmentVariable("TMPDIR");
    return named.isEmpty() ? QDir::tempPath() : named;
}

void load(Store *store, const QByteArray &content)
{
    QTemporaryFile file(temporaryFolder() + "/hmi-rules-XXXXXX");
    if (!file.open() || file.write(content) != content.size() || !file.flush()) {
        throw std::runtime_error(
            QString("no temporary file can be written in \"%1\" (%2); the variable TMPDIR of the "
                    "environment names another folder")
                .arg(temporaryFolder(), file.errorString())
                .toStdString());
    }
    store->loadInterruptionBehaviors(file.fileName());
}

} // namespace

LoadedStore loadStore(const QList<QByteArray> &contents)
{
    ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = &domainNumbers();
    Listener listener;
    LoadedStore result;
    result.store = std::make_unique<Store>();
    for (const QByteArray &content : contents) {
        load(result.store.get(), content);
        result.warnings.append(listener.take());
    }
    return result;
}

int numberOfDomain(const QString &name)
{
    return domainNumbers().domainFromName(name);
}

} // namespace hmirules
