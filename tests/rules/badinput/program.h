#pragma once

#include <QProcess>
#include <QStringList>

/** How hmi-rules ended. */
struct Ended
{
    bool isInTime;
    int exitCode; ///< -1 after a crash
    QByteArray output;
    QByteArray errors;
};

/** One run of the program in a folder, as somebody whose permissions count even if it is root. */
class Program : public QProcess
{
    Q_OBJECT

public:
    explicit Program(const QString &folder);

    void setVariable(const QString &name, const QString &value);

    Ended run(const QStringList &arguments, const QByteArray &input = QByteArray());

    /** The same by a line for the shell, in which $RULES is the program. */
    Ended runShell(const QString &line);

protected:
    void setupChildProcess() override;

private:
    Ended wait();
};
