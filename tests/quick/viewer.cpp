// A program that is not linked to the library, as viewers and designers are not: it loads a scene
// with the import path that it is given, and prints the scene's property "result".

#include <QGuiApplication>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QUrl>

#include <cstdio>
#include <memory>

int main(int argc, char **argv)
{
    QGuiApplication app(argc, argv);
    const QStringList arguments = QCoreApplication::arguments();
    if (arguments.size() != 3) {
        std::fputs("viewer IMPORT_PATH FILE\n", stderr);
        return 2;
    }
    QQmlEngine engine;
    engine.addImportPath(arguments.at(1));
    QQmlComponent component(&engine, QUrl::fromLocalFile(arguments.at(2)));
    const std::unique_ptr<QObject> scene(component.create());
    if (!scene) {
        std::fputs(qPrintable(component.errorString()), stderr);
        return 1;
    }
    std::puts(qPrintable(scene->property("result").toString()));
    return 0;
}
