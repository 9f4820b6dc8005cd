#include <QCryptographicHash>
#include <QDir>
#include <QFile>
#include <QImage>
#include <QJsonDocument>
#include <QJsonObject>
#include <QProcess>
#include <QTemporaryDir>
#include <QTest>

namespace {

QProcess *startTour(const QString &folder, QObject *parent)
{
    auto *process = new QProcess(parent);
    process->setProcessChannelMode(QProcess::ForwardedChannels);
    process->start(QStringLiteral(FAVRIN_GALLERY), {QStringLiteral("--tour=") + folder});
    return process;
}

} // namespace

/** Plays the tour once, with the real processes, and looks at what it leaves. */
class TourTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        QProcess *process = startTour(m_folder.path(), this);
        // The tour has a watchdog of its own for every step.
        QTRY_COMPARE_WITH_TIMEOUT(process->state(), QProcess::NotRunning, 280'000);
        QCOMPARE(process->exitStatus(), QProcess::NormalExit);
        QCOMPARE(process->exitCode(), 0);
    }

    void leavesPictures_data()
    {
        QTest::addColumn<QSize>("size");
        QTest::addColumn<bool>("dark");

        const QSize desktop(1240, 820);
        const QSize phone(390, 844);
        QTest::newRow("presented-light") << desktop << false;
        QTest::newRow("popover-light") << desktop << false;
        QTest::newRow("embedded-light") << desktop << false;
        QTest::newRow("presented-dark") << desktop << true;
        QTest::newRow("popover-dark") << desktop << true;
        QTest::newRow("embedded-dark") << desktop << true;
        QTest::newRow("presented-right-to-left") << desktop << false;
        QTest::newRow("embedded-right-to-left") << desktop << false;
        QTest::newRow("presented-phone") << phone << false;
        QTest::newRow("embedded-phone-dark") << phone << true;
        QTest::newRow("popover-tablet") << QSize(820, 1180) << false;
        QTest::newRow("presented-light-3x") << desktop * 3 << false;
    }

    void leavesPictures()
    {
        QFETCH(QSize, size);
        QFETCH(bool, dark);
        const QImage image = picture(QString::fromLatin1(QTest::currentDataTag()));
        QCOMPARE(image.size(), size);
        QCOMPARE(image.pixelColor(0, 0).lightnessF() < 0.5f, dark);
    }

    void theBookShowsEveryFace()
    {
        const QDir folder(m_folder.path());
        const QStringList faces = folder.entryList({QStringLiteral("picker-*.png")});
        QCOMPARE(faces.size(), 72);
        QSet<QByteArray> different;
        for (const QString &face : faces) {
            const QImage image(folder.filePath(face));
            QCOMPARE(image.width(), face.contains(u"landscape") ? 568 : 360);
            QCOMPARE(image.pixelColor(2, 2).lightnessF() < 0.5f, face.contains(u"-dark-"));
            different.insert(QCryptographicHash::hash(
                {reinterpret_cast<const char *>(image.constBits()), image.sizeInBytes()}, QCryptographicHash::Md5));
        }
        QCOMPARE(different.size(), faces.size());
        QVERIFY(!picture(QStringLiteral("picture-book-light")).isNull());
        QVERIFY(!picture(QStringLiteral("picture-book-dark")).isNull());
    }

    void strokesEndInFinalPicks()
    {
        QFile file(m_folder.filePath(QStringLiteral("picks.jsonl")));
        QVERIFY(file.open(QIODevice::ReadOnly));
        int finals = 0;
        int volatiles = 0;
        QJsonObject previous;
        while (!file.atEnd()) {
            QJsonObject pick = QJsonDocument::fromJson(file.readLine()).object();
            QCOMPARE(pick.keys(), QStringList({QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("colorSpace"),
                                               QStringLiteral("g"), QStringLiteral("r"), QStringLiteral("volatile")}));
            const bool isVolatile = pick.take(QStringLiteral("volatile")).toBool(true);
            if (!isVolatile) {
                // A touch, four moves, and the same color again when the finger lifts.
                QVERIFY2(volatiles >= 5, "a stroke reported too few colors on its way");
                QCOMPARE(pick, previous);
                ++finals;
            }
            volatiles = isVolatile ? volatiles + 1 : 0;
            previous = pick;
        }
        // One stroke in each of the pictures but the one at another scale.
        QCOMPARE(finals, 11);
        QCOMPARE(volatiles, 0);
    }

    void aFolderThatCannotBeMadeIsAnError()
    {
        QProcess *process = startTour(QStringLiteral("/dev/null/tour"), this);
        QTRY_COMPARE(process->state(), QProcess::NotRunning);
        QCOMPARE(process->exitCode(), 1);
    }

private:
    QImage picture(const QString &name) const { return QImage(m_folder.filePath(name + QStringLiteral(".png"))); }

    QTemporaryDir m_folder;
};

QTEST_GUILESS_MAIN(TourTest)
#include "tst_tour.moc"
