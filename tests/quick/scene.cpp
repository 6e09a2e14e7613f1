#include "scene.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QQmlComponent>
#include <QtTest>
#include <QVariantAnimation>

namespace {

QList<QVariantAnimation *> movesOf(const QQuickItem *host)
{
    QList<QVariantAnimation *> moves;
    const auto animations = host->findChildren<QVariantAnimation *>();
    for (QVariantAnimation *animation : animations) {
        if (animation->state() == QAbstractAnimation::Running) {
            moves.append(animation);
        }
    }
    return moves;
}

} // namespace

bool Files::write(const QString &name, const QByteArray &text)
{
    QFile file(m_folder.filePath(name));
    return m_folder.isValid() && QDir().mkpath(QFileInfo(file).path())
        && file.open(QIODevice::WriteOnly) && file.write(text) == text.size();
}

QUrl Files::url(const QString &name) const
{
    return QUrl::fromLocalFile(m_folder.filePath(name));
}

Scene::Scene(const QByteArray &qml, const QUrl &url)
{
    engine.setOutputWarningsToStandardError(false);
    QObject::connect(&engine, &QQmlEngine::warnings, &engine, [this](const QList<QQmlError> &list) {
        for (const QQmlError &error : list) {
            m_warnings.append(QString::number(error.line()) + ": " + error.description());
        }
    });
    window.resize(400, 300);
    QQmlComponent component(&engine);
    component.setData("import QtQuick 2.15\nimport HmiStateMachine 1.0\n" + qml, url);
    std::unique_ptr<QObject> object(component.beginCreate(engine.rootContext()));
    auto *item = qobject_cast<QQuickItem *>(object.get());
    if (!item) {
        QTest::qFail(qPrintable(component.errorString()), __FILE__, __LINE__);
        return;
    }
    item->setParentItem(window.contentItem());
    item->setSize(QSizeF(400, 300));
    component.completeCreate();
    object.release();
    m_root.reset(item);
}

Scene::~Scene()
{
    m_root.reset();
    for (const QString &warning : qAsConst(m_warnings)) {
        QTest::qFail(qPrintable("Unexpected warning: " + warning), __FILE__, __LINE__);
    }
}

QStringList Scene::takeWarnings()
{
    QStringList warnings;
    warnings.swap(m_warnings);
    return warnings;
}

void finishMoves(const QQuickItem *host)
{
    const auto moves = movesOf(host);
    for (QVariantAnimation *move : moves) {
        move->setCurrentTime(move->totalDuration());
    }
}

void moveHalfway(const QQuickItem *host)
{
    const auto moves = movesOf(host);
    for (QVariantAnimation *move : moves) {
        move->setCurrentTime(move->totalDuration() / 2);
    }
}

QQuickItem *itemIn(const QQuickItem *host, const QString &objectName)
{
    const auto items = host->childItems();
    for (QQuickItem *item : items) {
        if (item->objectName() == objectName) {
            return item;
        }
    }
    return nullptr;
}
