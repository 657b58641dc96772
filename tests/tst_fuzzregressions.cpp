// Inputs the fuzzers found (and hand-made hostile ones) replayed on every run.

#include "fuzz/catalog_reader_property.h"

#include <QDir>
#include <QFile>
#include <QtTest>

class TestFuzzRegressions : public QObject
{
    Q_OBJECT

private slots:
    void catalogReader_data()
    {
        QTest::addColumn<QString>("path");
        const QDir dir(QStringLiteral(HB_TEST_DATA "/fuzz/catalog"));
        for (const QString& name : dir.entryList(QDir::Files))
            QTest::newRow(qPrintable(name)) << dir.filePath(name);
        const QDir fixtures(QStringLiteral(HB_TEST_DATA "/catalog"));
        QVERIFY(!fixtures.entryList(QDir::Files).isEmpty());
    }

    void catalogReader()
    {
        QFETCH(QString, path);
        QFile file(path);
        QVERIFY(file.open(QIODevice::ReadOnly));
        const QByteArray bytes = file.readAll();
        // Aborts on a broken property; a file named ok-* must also read.
        const bool read =
            fuzzing::CheckCatalogBytes(std::string_view(bytes.constData(), bytes.size()));
        if (QFileInfo(path).fileName().startsWith("ok-"))
            QVERIFY(read);
    }
};

QTEST_GUILESS_MAIN(TestFuzzRegressions)
#include "tst_fuzzregressions.moc"
