#include <QColor>
#include <QDir>
#include <QImage>
#include <QProcess>
#include <QSet>
#include <QTemporaryDir>
#include <QTest>

namespace {

struct Outcome
{
    int exitCode;
    QByteArray told; ///< on stderr
};

Outcome takePictures(const QString &folder)
{
    QProcess headunit;
    headunit.start(HEADUNIT, {"--screenshots", folder, SCENARIO});
    const bool ended = headunit.waitForFinished(120000);
    return {ended ? headunit.exitCode() : -1, headunit.readAllStandardError()};
}

int numberOfColours(const QImage &picture)
{
    QSet<QRgb> colours;
    for (int y = 0; y < picture.height(); y += 7) {
        for (int x = 0; x < picture.width(); x += 7) {
            colours.insert(picture.pixel(x, y));
        }
    }
    return colours.size();
}

} // namespace

class tst_Screenshots : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void eachStepHasAPictureThatIsToldOf();
    void aPictureShowsTheDisplay_data();
    void aPictureShowsTheDisplay();
    void pictureOfAStepDiffersFromTheOneBefore();
    void aPictureThatCannotBeWrittenEndsTheScenario();

private:
    const QTemporaryDir m_folder;
};

void tst_Screenshots::eachStepHasAPictureThatIsToldOf()
{
    const QString folder = m_folder.filePath("made/by/it");

    const Outcome outcome = takePictures(folder);

    QCOMPARE(outcome.told,
             QString("picture of \"set vehicle.ready true\": %1/001-set-vehicle.ready-true.png\n"
                     "picture of \"wait 200\": %1/002-wait-200.png\n"
                     "picture of \"view Media/Browser {\"folder\":\"Jazz\"}\": "
                     "%1/003-view-Media-Browser-folder-Jazz.png\n"
                     "picture of \"popup navigation/traffic "
                     "{\"minutes\":12,\"road\":\"Ring Road\"}\": "
                     "%1/004-popup-navigation-traffic-minutes-12-road.png\n"
                     "picture of \"key Back 1\": %1/005-key-Back-1.png\n")
                 .arg(folder)
                 .toUtf8());
    QCOMPARE(outcome.exitCode, 0);
    QCOMPARE(
        QDir(folder).entryList(QDir::Files),
        QStringList({"001-set-vehicle.ready-true.png", "002-wait-200.png",
                     "003-view-Media-Browser-folder-Jazz.png",
                     "004-popup-navigation-traffic-minutes-12-road.png", "005-key-Back-1.png"}));
}

void tst_Screenshots::aPictureShowsTheDisplay_data()
{
    QTest::addColumn<QString>("name");
    QTest::newRow("welcome") << "001-set-vehicle.ready-true.png";
    QTest::newRow("home") << "002-wait-200.png";
    QTest::newRow("browser") << "003-view-Media-Browser-folder-Jazz.png";
    QTest::newRow("popup") << "004-popup-navigation-traffic-minutes-12-road.png";
    QTest::newRow("back") << "005-key-Back-1.png";
}

void tst_Screenshots::aPictureShowsTheDisplay()
{
    QFETCH(QString, name);

    const QImage picture(m_folder.filePath("made/by/it/" + name));

    QCOMPARE(picture.size(), QSize(1280, 720));
    QVERIFY(numberOfColours(picture) > 20);
}

void tst_Screenshots::pictureOfAStepDiffersFromTheOneBefore()
{
    const QDir folder(m_folder.filePath("made/by/it"));
    const QStringList names = folder.entryList(QDir::Files);
    QCOMPARE(names.size(), 5);

    for (int i = 1; i < names.size(); ++i) {
        QVERIFY2(QImage(folder.filePath(names[i])) != QImage(folder.filePath(names[i - 1])),
                 qPrintable(names[i]));
    }
}

void tst_Screenshots::aPictureThatCannotBeWrittenEndsTheScenario()
{
    const QString folder = m_folder.filePath("taken");
    QVERIFY(QDir().mkpath(folder + "/002-wait-200.png"));

    const Outcome outcome = takePictures(folder);

    QCOMPARE(outcome.told,
             QString("picture of \"set vehicle.ready true\": %1/001-set-vehicle.ready-true.png\n"
                     "%2:5: expected to write the picture \"%1/002-wait-200.png\", "
                     "found an error of the file\n"
                     "    remedy: look whether the folder can be written to and the disk is full\n")
                 .arg(folder, SCENARIO)
                 .toUtf8());
    QCOMPARE(outcome.exitCode, 1);
}

QTEST_GUILESS_MAIN(tst_Screenshots)

#include "tst_screenshots.moc"
