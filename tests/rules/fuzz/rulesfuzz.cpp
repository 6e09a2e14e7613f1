#include "oracle.h"

#include <QJsonDocument>
#include <QJsonParseError>

#include <sys/mman.h>
#include <unistd.h>

using namespace HmiStateMachine;
using namespace hmirules;

namespace {

constexpr std::size_t sitesAsked = 64; // further ones only cost time

void forget(QtMsgType, const QMessageLogContext &, const QString &)
{
}

/** A file in memory, which has a path to be opened by. */
class MemoryFile
{
public:
    MemoryFile() : m_descriptor(memfd_create("rules", 0))
    {
        require(m_descriptor >= 0, "a file in memory is made");
    }

    QString write(const QByteArray &content)
    {
        require(ftruncate(m_descriptor, 0) == 0
                    && pwrite(m_descriptor, content.constData(), std::size_t(content.size()), 0)
                        == content.size(),
                "the file is written");
        return QString("/proc/self/fd/%1").arg(m_descriptor);
    }

private:
    int m_descriptor;
};

} // namespace

// Qt's JSON parser loses the value of a repeated key, and arrays that a fault ends. Only the last
// frame of it is known.
extern "C" const char *__lsan_default_suppressions()
{
    return "leak:libQt5Core.so\n";
}

extern "C" int LLVMFuzzerInitialize(int *, char ***)
{
    qInstallMessageHandler(forget);
    qputenv("TMPDIR", "/dev/shm"); // the tool's temporary files need no disk
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, std::size_t size)
{
    static MemoryFile memory;
    const QByteArray content(reinterpret_cast<const char *>(data), static_cast<int>(size));
    loadStore({}); // publishes the numbers of domains
    PopupInterruptionStore store;
    store.loadInterruptionBehaviors(memory.write(content));

    RuleFile file;
    Fault fault;
    if (!file.take("fuzz.json", content, &fault)) {
        require(!fault.message.isEmpty() && !fault.remedy.isEmpty() && fault.at.line > 0,
                "a refusal has a message, a remedy and a place");
        return 0;
    }
    QJsonParseError error;
    QJsonDocument::fromJson(content, &error);
    require(error.error == QJsonParseError::NoError, "what the tool reads the library reads");
    const RuleBase base({file});
    if (base.sites().size() <= sitesAsked) {
        checkAnswers(base, store);
        checkReports(base);
    }
    return 0;
}
