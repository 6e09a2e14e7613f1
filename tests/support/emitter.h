#pragma once

#include <QObject>
#include <QString>
#include <QVariant>

/** The application's side of signal, key and property transitions. */
class Emitter : public QObject
{
    Q_OBJECT
    Q_PROPERTY(int value READ value WRITE setValue NOTIFY valueChanged)
    Q_PROPERTY(int silent READ value)

public:
    using QObject::QObject;

    int value() const { return m_value; }

    /** Emits on a change only. */
    void setValue(int value)
    {
        if (value != m_value) {
            m_value = value;
            Q_EMIT valueChanged();
        }
    }

Q_SIGNALS:
    void valueChanged();
    void plain();
    void other();
    void withInt(int number);
    void withUInt(uint number);
    void withLongLong(qlonglong number);
    void withDouble(double number);
    void withText(const QString &text);
    void withTwo(int number, const QString &text);
    void withVariants(const QVariant &first, const QVariant &second);
    void key(int code, int status);

private:
    int m_value = 0;
};
