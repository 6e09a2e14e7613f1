#pragma once

#include <QQmlEngine>
#include <QQmlIncubationController>
#include <QQuickItem>
#include <QQuickWindow>
#include <QStringList>
#include <QTemporaryDir>
#include <QUrl>

#include <memory>

/** QML files of one test. */
class Files
{
public:
    /** Writes a file, with the folders that its name has; false when that fails. */
    bool write(const QString &name, const QByteArray &text);

    QUrl url(const QString &name) const;

private:
    QTemporaryDir m_folder;
};

/**
 * A window of 400 by 300 that is filled by the item in a piece of QML, which stands as if in a file
 * at @p url. A warning of the engine that is not taken fails the test.
 */
class Scene
{
public:
    explicit Scene(const QByteArray &qml, const QUrl &url = QUrl("file:///scene/Scene.qml"));
    ~Scene();

    /** Null when the QML has faults. */
    QQuickItem *root() const { return m_root.get(); }

    /** The root itself, or the item of that name below it. */
    template <typename T = QQuickItem> T *find(const QString &objectName) const
    {
        return m_root->objectName() == objectName ? qobject_cast<T *>(m_root.get())
                                                  : m_root->findChild<T *>(objectName);
    }

    /** Destroys all that the QML has made. */
    void clear() { m_root.reset(); }

    /** What the engine warned of, as "<line>: <text>". */
    QStringList takeWarnings();

private:
    Q_DISABLE_COPY(Scene)

    QStringList m_warnings;

public:
    QQmlEngine engine;
    QQuickWindow window;

private:
    std::unique_ptr<QQuickItem> m_root;
};

/** Lets the scene go on with what it loads only when it is told to. */
class StepwiseIncubation : public QQmlIncubationController
{
public:
    explicit StepwiseIncubation(QQmlEngine &engine) : m_engine(engine)
    {
        engine.setIncubationController(this);
    }
    ~StepwiseIncubation() override { m_engine.setIncubationController(nullptr); }

    void finish() { incubateFor(10000); }

private:
    QQmlEngine &m_engine;
};

/** Lets all that moves below @p host reach its end, or the middle of its way, now. */
void finishMoves(const QQuickItem *host);
void moveHalfway(const QQuickItem *host);

/** The item of that object name which @p host shows, also one that is on its way out. */
QQuickItem *itemIn(const QQuickItem *host, const QString &objectName);
