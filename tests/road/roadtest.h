#pragma once

#include "roadhost.h"

#include <QTemporaryDir>

#include <memory>

/** What every road test starts with: stored settings of its own, empty each time, and no picker of the test before. */
class RoadTest : public QObject
{
    Q_OBJECT

protected:
    QString defaultsFile() const { return m_data.filePath(QStringLiteral("defaults.sqlite")); }
    const QPointingDevice *touchScreen() const { return m_touchScreen.get(); }

private Q_SLOTS:
    void initTestCase()
    {
        QVERIFY(m_data.isValid());
        qputenv("FAVRIN_DEFAULTS_FILE", QFile::encodeName(defaultsFile()));
        QQuickWindow::setGraphicsApi(QSGRendererInterface::Software);
    }
    void cleanup()
    {
        qunsetenv("FAVRIN_COLOR_PICKER_SERVICE");
        QTRY_VERIFY(servicesOf(getpid()).empty());
        for (const auto &file : QDir(m_data.path()).entryInfoList(QDir::Files))
            QVERIFY(QFile::remove(file.filePath()));
    }

private:
    QTemporaryDir m_data;
    const std::unique_ptr<QPointingDevice> m_touchScreen{QTest::createTouchDevice()};
};
