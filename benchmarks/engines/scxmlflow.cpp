#include "scxmlflow.h"

#include <QBuffer>
#include <QCoreApplication>
#include <QXmlStreamWriter>

namespace {

QString requestFor(const QString &view)
{
    return QStringLiteral("view.") + view;
}

QByteArray documentFor(const FlowShape &shape)
{
    const QStringList names = shape.viewNames();
    QByteArray result;
    QXmlStreamWriter xml(&result);
    xml.writeStartDocument();
    xml.writeStartElement(QStringLiteral("scxml"));
    xml.writeDefaultNamespace(QStringLiteral("http://www.w3.org/2005/07/scxml"));
    xml.writeAttribute(QStringLiteral("version"), QStringLiteral("1.0"));
    xml.writeStartElement(QStringLiteral("state"));
    xml.writeAttribute(QStringLiteral("id"), QStringLiteral("views"));
    for (const QString &name : names) {
        xml.writeEmptyElement(QStringLiteral("transition"));
        xml.writeAttribute(QStringLiteral("type"), QStringLiteral("internal"));
        xml.writeAttribute(QStringLiteral("event"), requestFor(name));
        xml.writeAttribute(QStringLiteral("target"), name);
    }
    for (const QString &name : names) {
        xml.writeEmptyElement(QStringLiteral("state"));
        xml.writeAttribute(QStringLiteral("id"), name);
    }
    xml.writeEndDocument();
    return result;
}

} // namespace

ScxmlShapeFlow::ScxmlShapeFlow(const FlowShape &shape)
{
    QByteArray document = documentFor(shape);
    QBuffer buffer(&document);
    buffer.open(QIODevice::ReadOnly);
    m_machine.reset(QScxmlStateMachine::fromData(&buffer));
    const QStringList names = shape.viewNames();
    const QStringList screens = shape.screens();
    for (int i = 0; i < names.size(); ++i) {
        followView(names.at(i), screens.at(i));
        m_requests.append(requestFor(names.at(i)));
    }
    m_machine->connectToEvent(QStringLiteral("view.*"), m_machine.get(),
                              [this](const QScxmlEvent &event) { m_data = event.data(); });
    m_machine->start();
    QCoreApplication::sendPostedEvents();
}

ScxmlShapeFlow::~ScxmlShapeFlow() = default;

void ScxmlShapeFlow::requestView(int index, int data)
{
    submit(m_requests.at(index), data);
}

void ScxmlShapeFlow::submit(const QString &name, const QVariant &data)
{
    m_machine->submitEvent(name, data);
    QCoreApplication::sendPostedEvents();
}

void ScxmlShapeFlow::followView(const QString &name, const QString &screen)
{
    m_views.push_back(std::make_unique<PlainView>(screen));
    PlainView *view = m_views.back().get();
    m_machine->connectToState(name, m_machine.get(), [this, view](bool active) {
        if (active) {
            view->enter(m_layer, m_data);
        } else {
            view->leave(m_layer);
        }
    });
}
