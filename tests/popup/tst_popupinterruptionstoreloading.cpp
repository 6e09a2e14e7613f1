#include "interruptions.h"
#include "librarytest.h"
#include "recordingviewstatetarget.h"

#include <HmiStateMachine/popup/popupinterruptionstore.h>

#include <QDir>
#include <QTemporaryDir>
#include <QThread>
#include <QtTest>

#include <linux/capability.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/syscall.h>
#include <unistd.h>

#include <memory>

using namespace HmiStateMachine;

namespace {

constexpr char oneEntry[] = R"([{"popup": "phone/call", "default": "Prohibit"}])";

/** While it lives, permissions of files count for this thread even when it runs as root. */
class AsOrdinaryUser
{
public:
    AsOrdinaryUser()
    {
        m_valid = syscall(SYS_capget, &m_header, m_saved) == 0;
        __user_cap_data_struct reduced[2] = {m_saved[0], m_saved[1]};
        reduced[0].effective &= ~(1U << CAP_DAC_OVERRIDE | 1U << CAP_DAC_READ_SEARCH);
        m_valid = m_valid && syscall(SYS_capset, &m_header, reduced) == 0;
    }
    ~AsOrdinaryUser() { syscall(SYS_capset, &m_header, m_saved); }

    bool isValid() const { return m_valid; }

private:
    Q_DISABLE_COPY(AsOrdinaryUser)

    __user_cap_header_struct m_header = {_LINUX_CAPABILITY_VERSION_3, 0};
    __user_cap_data_struct m_saved[2] = {};
    bool m_valid;
};

/** While it lives, the process can open no further file. */
class OutOfDescriptors
{
public:
    OutOfDescriptors()
    {
        getrlimit(RLIMIT_NOFILE, &m_saved);
        const rlimit none = {0, m_saved.rlim_max};
        m_valid = setrlimit(RLIMIT_NOFILE, &none) == 0;
    }
    ~OutOfDescriptors() { setrlimit(RLIMIT_NOFILE, &m_saved); }

    bool isValid() const { return m_valid; }

private:
    Q_DISABLE_COPY(OutOfDescriptors)

    rlimit m_saved = {};
    bool m_valid;
};

bool canOpen(const QString &path)
{
    return QFile(path).open(QIODevice::ReadOnly);
}

bool write(const QString &path, const QByteArray &content)
{
    QFile file(path);
    return file.open(QIODevice::WriteOnly) && file.write(content) == content.size();
}

QString dataFile(const QString &name)
{
    return QStringLiteral(HMI_TEST_DATA_DIR "/interruptions/") + name;
}

QString invalidFile(const QString &path)
{
    return "warning loadInterruptionBehaviors: Invalid popup interruption file. \"" + path + '"';
}

QString parseError(const QString &text)
{
    return "warning loadInterruptionBehaviors: Popup interruption file json parse error: \"" + text
        + '"';
}

// A rule for each number, written by hand into the text of a file.
QByteArray manyEntries(int count)
{
    QByteArray json = "[";
    for (int i = 0; i < count; ++i) {
        const QByteArray number = QByteArray::number(i);
        json += "{\"popup\":\"m" + number + "/p\",\"interruptions\":[{\"target\":\"t" + number
            + "/q\",\"behavior\":\"Prohibit\"}]},";
    }
    json.chop(1);
    return json + ']';
}

QByteArray nested(int depth)
{
    return QByteArray(depth, '[') + QByteArray(depth, ']');
}

// Has another thread write to a named pipe while the store reads from it.
template <typename Action>
void loadFromPipe(PopupInterruptionStore &store, const QString &path, Action writeAndClose)
{
    const std::unique_ptr<QThread> writer(QThread::create([&] {
        QFile pipe(path);
        if (pipe.open(QIODevice::WriteOnly | QIODevice::Unbuffered)) {
            writeAndClose(pipe);
        }
    }));
    writer->start();
    store.loadInterruptionBehaviors(path);
    writer->wait();
}

} // namespace

/** How the store reads its file, and what it says about the faults in it. */
class tst_PopupInterruptionStoreLoading : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void warningsOfAFile_data();
    void warningsOfAFile();
    void whatIsRightInAFileLoads_data();
    void whatIsRightInAFileLoads();
    void blacklistsOfAFile_data();
    void blacklistsOfAFile();
    void domainsAreConvertedInTheOrderOfTheFile();
    void withoutAViewLayerOnlyDomainsAreLeftOut();
    void aSecondFileIsMergedIntoTheFirst();
    void aFaultyFileLeavesWhatWasLoaded_data();
    void aFaultyFileLeavesWhatWasLoaded();
    void aMessageCarriesCategoryFileAndLine();
    void faultsAreSilentWhileWarningsAreOff();
    void generatedText_data();
    void generatedText();
    void aByteOrderMarkIsPassedOver();
    void manyEntriesAllLoad();
    void eachOfManyFaultsIsReported();
    void aLongNameLoads();
    void pathsThatAreNoFile_data();
    void pathsThatAreNoFile();
    void aFileWithoutPermissionIsInvalid();
    void aFileIsInvalidWhileNoDescriptorIsLeft();
    void aFileThatVanishesWhileItIsReadLoads();
    void aFileThatEndsEarlyIsAParseError();
};

void tst_PopupInterruptionStoreLoading::warningsOfAFile_data()
{
    QTest::addColumn<QString>("name");

    const QStringList files = QDir(dataFile("")).entryList({"*.json"}, QDir::Files, QDir::Name);
    QVERIFY2(!files.isEmpty(), qPrintable(dataFile("*.json")));
    for (const QString &file : files) {
        const QString name = file.chopped(5);
        QTest::newRow(qPrintable(name)) << name;
    }
}

void tst_PopupInterruptionStoreLoading::warningsOfAFile()
{
    QFETCH(QString, name);
    QFile expected(dataFile(name + ".expected"));
    QVERIFY2(expected.open(QIODevice::ReadOnly), qPrintable(expected.fileName()));
    Journal journal;
    const RecordingViewStateTarget layer(journal);
    PopupInterruptionStore store;

    store.loadInterruptionBehaviors(dataFile(name + ".json"));

    QCOMPARE(messages().take(),
             QString::fromUtf8(expected.readAll()).split('\n', Qt::SkipEmptyParts));
}

void tst_PopupInterruptionStoreLoading::whatIsRightInAFileLoads_data()
{
    QTest::addColumn<QString>("file");
    QTest::addColumn<QString>("popup");
    QTest::addColumn<QString>("target");
    QTest::addColumn<int>("behavior");

    const auto row = [](const char *file, const QString &popup, const QString &target,
                        int behavior) {
        const QByteArray tag = QByteArray(file) + ": " + popup.toUtf8() + ' ' + target.toUtf8();
        QTest::newRow(tag.constData()) << file << popup << target << behavior;
    };
    row("complete", "phone/call", "car/fuel", 0);
    row("complete", "phone/call", "car/door", 1);
    row("complete", "phone/call", "radio/news", 2);
    row("complete", "phone/call", "car/belt", 3);
    row("complete", "phone/call", "car/lamp", 2);
    row("complete", "radio/news", "car/lamp", 0);
    row("complete", "nothing/said", "car/lamp", 1);
    row("any-case-of-behaviors", "phone/call", "car/fuel", 0);
    row("any-case-of-behaviors", "phone/call", "car/door", 1);
    row("any-case-of-behaviors", "phone/call", "car/belt", 2);
    row("any-case-of-behaviors", "phone/call", "car/lamp", 3);
    row("any-case-of-behaviors", "phone/call", "car/seat", 0);
    row("top-level-object", "phone/call", "car/fuel", 1);
    row("invalid-sources", "phone/call", "car/fuel", 0);
    row("invalid-sources", "phone/sms", "car/fuel", 1);
    row("invalid-sources", "phone/fax", "car/fuel", 2);
    row("invalid-sources", "", "car/fuel", 1);
    row("invalid-targets", "phone/call", "car/fuel", 0);
    row("invalid-targets", "phone/call", "car/door", 2);
    row("invalid-targets", "phone/call", "car/belt", 3);
    row("invalid-targets", "phone/call", "", 3);
    row("invalid-behaviors", "phone/call", "car/fuel", 0);
    row("invalid-behaviors", "phone/call", "car/door", 2);
    row("invalid-behaviors", "phone/call", "car/belt", 3);
    row("faults-of-all-kinds", "phone/call", "car/fuel", 0);
    row("faults-of-all-kinds", "phone/call", "car/belt", -1);
    row("faults-of-all-kinds", "phone/sms", "car/fuel", 2);
    row("faults-of-all-kinds", "phone/sms", "car/belt", 3);
    row("interruptions-no-array", "phone/call", "car/fuel", 2);
    row("interruptions-no-array", "phone/sms", "car/fuel", 3);
    row("interruptions-no-array", "phone/fax", "car/fuel", 1);
    row("interruptions-no-array", "phone/mail", "car/fuel", 0);
    row("invalid-defaults", "phone/call", "car/fuel", -1);
    row("invalid-defaults", "phone/sms", "car/fuel", -1);
    row("invalid-defaults", "phone/fax", "car/fuel", -1);
    row("invalid-defaults", "phone/mail", "car/fuel", -1);
    row("invalid-defaults", "phone/chat", "car/fuel", 0);
    row("later-entries-replace", "phone/call", "car/fuel", 2);
    row("later-entries-replace", "phone/call", "car/door", 3);
    row("later-entries-replace", "phone/call", "car/belt", 2);
    row("unknown-keys", "phone/call", "car/fuel", 0);
    row("escaped-names", "phone/call", "car/fuel", 0);
    row("other-letters", QString::fromUtf8("t\u00e9l\u00e9/\u00fcbergabe"),
        QString::fromUtf8("\u8eca/\u71c3\u6599"), 0);
    row("truncated", "phone/call", "car/fuel", 1);
    row("text-behind", "phone/call", "car/fuel", 1);
}

void tst_PopupInterruptionStoreLoading::whatIsRightInAFileLoads()
{
    QFETCH(QString, file);
    QFETCH(QString, popup);
    QFETCH(QString, target);
    PopupInterruptionStore store;

    store.loadInterruptionBehaviors(dataFile(file + ".json"));

    messages().take();
    QTEST(static_cast<int>(store.getInterruptionBehavior(popup, target)), "behavior");
}

void tst_PopupInterruptionStoreLoading::blacklistsOfAFile_data()
{
    QTest::addColumn<QString>("file");
    QTest::addColumn<QString>("popup");
    QTest::addColumn<QList<int>>("domains");
    QTest::addColumn<QStringList>("views");

    const auto row = [](const char *file, const char *popup, const QList<int> &domains,
                        const QStringList &views) {
        const QByteArray tag = QByteArray(file) + ": " + popup;
        QTest::newRow(tag.constData()) << file << popup << domains << views;
    };
    row("complete", "phone/call", {1, 2}, {"Map", "Video"});
    row("complete", "radio/news", {3}, {});
    row("complete", "car/fuel", {}, {"Camera"});
    row("complete", "nothing/said", {}, {});
    row("odd-blacklists", "phone/call", {3}, {"Home"});
    row("odd-blacklists", "phone/sms", {3}, {"Home"});
    row("odd-blacklists", "phone/fax", {3}, {"Home"});
    row("odd-blacklists", "phone/mail", {1}, {"Map"});
    row("odd-blacklists", "phone/chat", {-1}, {""});
    row("later-entries-replace", "phone/call", {2}, {"Video"});
    row("top-level-object", "phone/call", {}, {});
}

void tst_PopupInterruptionStoreLoading::blacklistsOfAFile()
{
    QFETCH(QString, file);
    QFETCH(QString, popup);
    Journal journal;
    RecordingViewStateTarget layer(journal);
    layer.setDomains({{"media", 1}, {"navigation", 2}, {"phone", 3}});
    PopupInterruptionStore store;

    store.loadInterruptionBehaviors(dataFile(file + ".json"));

    QList<int> domains;
    for (int domain : {-1, 0, 1, 2, 3}) {
        if (store.isBlockedByDomain(popup, domain)) {
            domains.append(domain);
        }
    }
    QStringList views;
    for (const char *view : {"", "Camera", "Home", "Map", "Video"}) {
        if (store.isBlockedByView(popup, view)) {
            views.append(view);
        }
    }
    QTEST(domains, "domains");
    QTEST(views, "views");
}

void tst_PopupInterruptionStoreLoading::domainsAreConvertedInTheOrderOfTheFile()
{
    class NumberingLayer : public RecordingViewStateTarget
    {
    public:
        using RecordingViewStateTarget::RecordingViewStateTarget;

        int domainFromName(const QString &domainName) override
        {
            names.append(domainName);
            return 0;
        }

        QStringList names;
    };
    Journal journal;
    NumberingLayer layer(journal);
    PopupInterruptionStore store;

    store.loadInterruptionBehaviors(dataFile("complete.json"));

    QCOMPARE(layer.names, QStringList({"navigation", "media", "phone"}));
}

void tst_PopupInterruptionStoreLoading::withoutAViewLayerOnlyDomainsAreLeftOut()
{
    PopupInterruptionStore store;

    store.loadInterruptionBehaviors(dataFile("complete.json"));

    QVERIFY(store.isBlockedByView("phone/call", "Map"));
    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/fuel"), PopupState::Prohibit);
    for (int domain : {-1, 0, 1, 2, 3}) {
        QVERIFY(!store.isBlockedByDomain("phone/call", domain));
    }
}

void tst_PopupInterruptionStoreLoading::aSecondFileIsMergedIntoTheFirst()
{
    Journal journal;
    RecordingViewStateTarget layer(journal);
    layer.setDomains({{"media", 1}, {"navigation", 2}});
    PopupInterruptionStore store;
    store.loadInterruptionBehaviors(dataFile("complete.json"));

    const char json[] = R"([{"popup": "phone/call", "default": "Prohibit",
        "interruptions": [{"target": "car/fuel", "behavior": "AllowStack"},
                          {"target": "car/seat", "behavior": "AllowNoReturn"}],
        "domainBlacklist": [], "viewBlacklist": ["Radio"]}])";
    QVERIFY(loadInterruptions(store, json));

    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/fuel"), PopupState::AllowStack);
    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/seat"), PopupState::AllowNoReturn);
    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/belt"), PopupState::AllowNoReturn);
    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/lamp"), PopupState::Prohibit);
    QCOMPARE(store.getInterruptionBehavior("radio/news", "car/lamp"), PopupState::Prohibit);
    QVERIFY(store.isBlockedByDomain("phone/call", 1));
    QVERIFY(store.isBlockedByDomain("phone/call", 2));
    QVERIFY(store.isBlockedByView("phone/call", "Radio"));
    QVERIFY(!store.isBlockedByView("phone/call", "Map"));
}

void tst_PopupInterruptionStoreLoading::aFaultyFileLeavesWhatWasLoaded_data()
{
    QTest::addColumn<QString>("second");

    QTest::newRow("missing") << "no such file.json";
    QTest::newRow("no JSON") << "truncated.json";
    QTest::newRow("no array") << "top-level-object.json";
    QTest::newRow("empty array") << "empty-array.json";
}

void tst_PopupInterruptionStoreLoading::aFaultyFileLeavesWhatWasLoaded()
{
    QFETCH(QString, second);
    PopupInterruptionStore store;
    store.loadInterruptionBehaviors(dataFile("complete.json"));

    store.loadInterruptionBehaviors(dataFile(second));

    messages().take();
    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/belt"), PopupState::AllowNoReturn);
    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/lamp"), PopupState::AllowStack);
    QVERIFY(store.isBlockedByView("phone/call", "Map"));
}

void tst_PopupInterruptionStoreLoading::aMessageCarriesCategoryFileAndLine()
{
    PopupInterruptionStore store;
    store.loadInterruptionBehaviors(dataFile("faults-of-all-kinds.json"));
    store.loadInterruptionBehaviors(dataFile("truncated.json"));
    store.loadInterruptionBehaviors("");

    const QList<Message> written = messages().takeMessages();

    QCOMPARE(written.size(), 6);
    for (const Message &message : written) {
        QCOMPARE(message.category, "vosk.hmistatemachine");
        QCOMPARE(message.function, "loadInterruptionBehaviors");
        QVERIFY2(message.file.endsWith("popupinterruptionstore.cpp"), qPrintable(message.file));
        QVERIFY(message.line > 0);
    }
}

void tst_PopupInterruptionStoreLoading::faultsAreSilentWhileWarningsAreOff()
{
    PopupInterruptionStore store;
    messages().disableWarnings();

    store.loadInterruptionBehaviors(dataFile("faults-of-all-kinds.json"));
    store.loadInterruptionBehaviors(dataFile("truncated.json"));
    store.loadInterruptionBehaviors("");

    QCOMPARE(messages().take(), QStringList());
    QCOMPARE(store.getInterruptionBehavior("phone/sms", "car/fuel"), PopupState::AllowStack);
}

void tst_PopupInterruptionStoreLoading::generatedText_data()
{
    QTest::addColumn<QByteArray>("text");
    QTest::addColumn<QStringList>("warnings");

    QTest::newRow("empty") << QByteArray() << QStringList(parseError("illegal value"));
    QTest::newRow("blanks alone") << QByteArray(1000, ' ')
                                  << QStringList(parseError("illegal value"));
    QTest::newRow("zero bytes") << QByteArray(1000, '\0')
                                << QStringList(parseError("illegal value"));
    QTest::newRow("a byte order mark alone")
        << QByteArray("\xef\xbb\xbf") << QStringList(parseError("illegal value"));
    QTest::newRow("UTF-16") << QByteArray("\xff\xfe[\0]\0", 6)
                            << QStringList(parseError("illegal value"));
    QTest::newRow("invalid UTF-8 in a name") << QByteArray("[{\"popup\": \"phone\xff/call\"}]")
                                             << QStringList(parseError("invalid UTF8 string"));
    QTest::newRow("UTF-8 cut off") << QByteArray("[{\"popup\": \"phone\xe2\x82\"}]")
                                   << QStringList(parseError("invalid UTF8 string"));
    QTest::newRow("a surrogate in UTF-8") << QByteArray("[{\"popup\": \"phone\xed\xa0\x80\"}]")
                                          << QStringList(parseError("invalid UTF8 string"));
    QTest::newRow("arrays a hundred thousand deep")
        << nested(100000) << QStringList(parseError("too deeply nested document"));
    QTest::newRow("arrays open a hundred thousand deep")
        << QByteArray(100000, '[') << QStringList(parseError("too deeply nested document"));
    QTest::newRow("an entry of arrays a thousand deep")
        << nested(1000)
        << QStringList(
               "warning loadInterruptionBehaviors: Popup interruption invalid source at index: 0");
    QTest::newRow("rules of arrays nine hundred deep")
        << "[{\"popup\": \"phone/call\", \"interruptions\": " + nested(900) + "}]"
        << QStringList("warning loadInterruptionBehaviors: Popup interruption invalid target at "
                       "index: 0 0");
}

void tst_PopupInterruptionStoreLoading::generatedText()
{
    QFETCH(QByteArray, text);
    PopupInterruptionStore store;

    QVERIFY(loadInterruptions(store, text));

    QTEST(messages().take(), "warnings");
    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/fuel"), PopupState::Allow);
}

void tst_PopupInterruptionStoreLoading::aByteOrderMarkIsPassedOver()
{
    PopupInterruptionStore store;

    QVERIFY(loadInterruptions(store, QByteArray("\xef\xbb\xbf") + oneEntry));

    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/fuel"), PopupState::Prohibit);
}

void tst_PopupInterruptionStoreLoading::manyEntriesAllLoad()
{
    PopupInterruptionStore store;

    QVERIFY(loadInterruptions(store, manyEntries(100000)));

    int prohibited = 0;
    for (int i = 0; i < 100000; ++i) {
        const QString number = QString::number(i);
        if (store.getInterruptionBehavior('m' + number + "/p", 't' + number + "/q")
            == PopupState::Prohibit) {
            ++prohibited;
        }
    }
    QCOMPARE(prohibited, 100000);
    QCOMPARE(store.getInterruptionBehavior("m1/p", "t2/q"), PopupState::Allow);
}

void tst_PopupInterruptionStoreLoading::eachOfManyFaultsIsReported()
{
    PopupInterruptionStore store;

    QVERIFY(loadInterruptions(store, '[' + QByteArray("0,").repeated(10000) + (oneEntry + 1)));

    const QStringList written = messages().take();
    QCOMPARE(written.size(), 10000);
    QCOMPARE(written.last(),
             "warning loadInterruptionBehaviors: Popup interruption invalid source at index: 9999");
    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/fuel"), PopupState::Prohibit);
}

void tst_PopupInterruptionStoreLoading::aLongNameLoads()
{
    const QByteArray name(1000000, 'x');
    PopupInterruptionStore store;

    QVERIFY(
        loadInterruptions(store, "[{\"popup\": \"*/" + name + "\", \"default\": \"Prohibit\"}]"));

    QCOMPARE(store.getInterruptionBehavior("phone/" + name, "car/fuel"), PopupState::Prohibit);
    QCOMPARE(store.getInterruptionBehavior("phone/" + name + 'y', "car/fuel"), PopupState::Allow);
}

void tst_PopupInterruptionStoreLoading::pathsThatAreNoFile_data()
{
    QTest::addColumn<QString>("path");

    QTest::newRow("missing") << dataFile("no such file.json");
    QTest::newRow("in a missing folder") << dataFile("no such folder/complete.json");
    QTest::newRow("below a file") << dataFile("complete.json/complete.json");
    QTest::newRow("a folder") << QStringLiteral(HMI_TEST_DATA_DIR);
    QTest::newRow("a folder with a slash") << QStringLiteral(HMI_TEST_DATA_DIR "/");
    QTest::newRow("too long") << '/' + QString(5000, 'x');
    QTest::newRow("empty") << "";
}

void tst_PopupInterruptionStoreLoading::pathsThatAreNoFile()
{
    QFETCH(QString, path);
    PopupInterruptionStore store;

    store.loadInterruptionBehaviors(path);

    QCOMPARE(messages().take(), QStringList(invalidFile(path)));
    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/fuel"), PopupState::Allow);
}

void tst_PopupInterruptionStoreLoading::aFileWithoutPermissionIsInvalid()
{
    const QTemporaryDir folder;
    const QString path = folder.filePath("rules.json");
    QVERIFY(write(path, oneEntry));
    QVERIFY(QFile::setPermissions(path, {}));
    PopupInterruptionStore store;
    {
        const AsOrdinaryUser user;
        QVERIFY(user.isValid());
        QVERIFY(!canOpen(path));

        store.loadInterruptionBehaviors(path);
    }

    QCOMPARE(messages().take(), QStringList(invalidFile(path)));
    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/fuel"), PopupState::Allow);
}

void tst_PopupInterruptionStoreLoading::aFileIsInvalidWhileNoDescriptorIsLeft()
{
    const QTemporaryDir folder;
    const QString path = folder.filePath("rules.json");
    QVERIFY(write(path, oneEntry));
    PopupInterruptionStore store;
    {
        const OutOfDescriptors shortage;
        QVERIFY(shortage.isValid());
        QVERIFY(!canOpen(path));

        store.loadInterruptionBehaviors(path);
    }
    QCOMPARE(messages().take(), QStringList(invalidFile(path)));
    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/fuel"), PopupState::Allow);

    store.loadInterruptionBehaviors(path);

    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/fuel"), PopupState::Prohibit);
}

void tst_PopupInterruptionStoreLoading::aFileThatVanishesWhileItIsReadLoads()
{
    const QTemporaryDir folder;
    const QString path = folder.filePath("rules.json");
    QCOMPARE(mkfifo(qPrintable(path), 0600), 0);
    PopupInterruptionStore store;

    // The pipe can be opened for writing only once the store has opened it for reading.
    loadFromPipe(store, path, [&path](QFile &pipe) {
        QFile::remove(path);
        pipe.write(oneEntry);
    });

    QVERIFY(!QFile::exists(path));
    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/fuel"), PopupState::Prohibit);
}

void tst_PopupInterruptionStoreLoading::aFileThatEndsEarlyIsAParseError()
{
    const QTemporaryDir folder;
    const QString path = folder.filePath("rules.json");
    QCOMPARE(mkfifo(qPrintable(path), 0600), 0);
    PopupInterruptionStore store;

    loadFromPipe(store, path, [](QFile &pipe) { pipe.write(oneEntry, 20); });

    QCOMPARE(messages().take(), QStringList(parseError("unterminated string")));
    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/fuel"), PopupState::Allow);
}

QTEST_GUILESS_MAIN(tst_PopupInterruptionStoreLoading)
#include "tst_popupinterruptionstoreloading.moc"
