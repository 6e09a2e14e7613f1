#include "dump.h"

#include <QtTest>

class Sample : public QObject
{
    Q_OBJECT
    Q_CLASSINFO("DefaultProperty", "data")
    Q_PROPERTY(int data READ data WRITE setData RESET resetData NOTIFY dataChanged STORED false)
    Q_PROPERTY(int fixed READ data CONSTANT FINAL)

public:
    enum class Effect { Cut = 0, Fade = 4 };
    Q_ENUM(Effect)

    Q_INVOKABLE explicit Sample(QObject *parent = nullptr) : QObject(parent) { }
    int data() const { return m_data; }
    void setData(int data) { m_data = data; }
    void resetData() { m_data = 0; }
    Q_INVOKABLE QString text(int width, bool bold = false) const
    {
        return QString(width, bold ? 'B' : 'b');
    }

public Q_SLOTS:
    void clear() { resetData(); }

Q_SIGNALS:
    void dataChanged(int oldData, int data);

private Q_SLOTS:
    void tick() { ++m_data; }

private:
    int m_data = 0;
};

class Another : public Sample
{
    Q_OBJECT
};

class tst_MetaObjectDump : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void allThatAClassAddsHasALine();
};

void tst_MetaObjectDump::allThatAClassAddsHasALine()
{
    const QString dump = interfaceDump({&Sample::staticMetaObject, &Another::staticMetaObject});

    QCOMPARE(
        dump.split('\n'),
        QStringList(
            {"class Another: Sample", "class Sample: QObject", "    info DefaultProperty: data",
             "    constructor Sample(QObject* parent)",
             "    constructor Sample(), by default arguments",
             "    signal void dataChanged(int oldData, int data)", "    slot void clear()",
             "    private slot void tick()", "    method QString text(int width, bool bold)",
             "    method QString text(int width), by default arguments",
             "    property data: int, read, write, reset, not stored, notify dataChanged(int,int)",
             "    property fixed: int, read, constant, final", "    enum Effect: values, scoped",
             "    value Effect::Cut = 0", "    value Effect::Fade = 4", ""}));
}

QTEST_GUILESS_MAIN(tst_MetaObjectDump)
#include "tst_metaobjectdump.moc"
