// The program's folders, the picture-file test, archive copies and folder scans.

#include "catalog/app_folders.h"
#include "catalog/file_entry.h"
#include "catalog/file_status.h"
#include "tests/support/scripted_prompt.h"

#include <QDir>
#include <QFile>
#include <QSettings>
#include <QStandardPaths>
#include <QTemporaryDir>
#include <QtTest>

#include <fcntl.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

namespace {

const CTime kJuly5At1407(1057414020); // 2003-07-05 14:07 UTC (the tests run in UTC)

void WriteFile(const QString& path, const QByteArray& bytes)
{
    QDir().mkpath(QFileInfo(path).path());
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write(bytes);
}

QByteArray ReadFile(const QString& path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray("<missing>");
}

QStringList ScanPaths(const QString& folder, bool recursive)
{
    CFileEntry entry(folder.toStdString(), std::string());
    if (!entry.Scan(recursive))
        return {"<failed>"};
    QStringList out;
    for (const CFileEntry& child : entry.GetChildren()) {
        QString path = QString::fromStdString(child.GetPath());
        out << path.mid(folder.size() + 1);
    }
    out.sort();
    return out;
}

} // namespace

class TestFolders : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase() { QStandardPaths::setTestModeEnabled(true); }

    void isPictureFile_data()
    {
        QTest::addColumn<QString>("path");
        QTest::addColumn<int>("kind");
        QTest::newRow("JPG upper case") << "a.JPG" << 1;
        QTest::newRow("dib") << "a.dib" << 1;
        QTest::newRow("Emf") << "/x/a.Emf" << 1;
        QTest::newRow("rle") << "a.rle" << 1;
        QTest::newRow("jpeg is not") << "a.jpeg" << 2;
        QTest::newRow("tif") << "a.tif" << 2;
        QTest::newRow("no extension") << "a" << 2;
        QTest::newRow("dot in a folder name") << "/pics.old/readme" << 2;
        QTest::newRow("dot in a folder named like a picture") << "/x.jpg/readme" << 2;
    }

    void isPictureFile()
    {
        QFETCH(QString, path);
        QFETCH(int, kind);
        QCOMPARE(CAppFolders::IsPictureFile(path.toStdString()), kind);
    }

    void archiveNames()
    {
        QCOMPARE(CAppFolders::MakeArchiveName("/h/Archive/Pictures", "Beach.jpg", kJuly5At1407),
                 std::string("/h/Archive/Pictures/Beach-0307051407.jpg"));
        QCOMPARE(CAppFolders::MakeArchiveName("/h", "a.tar.gz", kJuly5At1407),
                 std::string("/h/a.tar-0307051407.gz"));
        QVERIFY(CAppFolders::MakeArchiveName("/h", "README", kJuly5At1407).empty());
    }

    void categoryFolders_data()
    {
        QTest::addColumn<QString>("category");
        QTest::addColumn<QString>("folder");
        QTest::newRow("nested") << "DOCUMENTS\\Letters\\2002"
                                << "DOCUMENTS/Letters/2002";
        QTest::newRow("climbing parts") << "DOCUMENTS\\..\\..\\etc"
                                        << "DOCUMENTS/_/_/etc";
        QTest::newRow("slash in a name") << "DOCUMENTS\\a/b"
                                         << "DOCUMENTS/a_b";
        QTest::newRow("empty part") << "DOCUMENTS\\\\x"
                                    << "DOCUMENTS/_/x";
    }

    void categoryFolders()
    {
        QFETCH(QString, category);
        QFETCH(QString, folder);
        QCOMPARE(QString::fromStdString(CAppFolders::CategoryToFolder(category.toStdString())),
                 folder);
    }

    void installFolderRule()
    {
        QTemporaryDir dir;
        const QByteArray savedHome = qgetenv("HEARTHBOOK_HOME");
        const QByteArray savedData = qgetenv("XDG_DATA_HOME");
        qputenv("XDG_DATA_HOME", (dir.path() + "/data").toUtf8());
        qunsetenv("HEARTHBOOK_HOME");
        QSettings settings("Veltrano", "Hearthbook");
        settings.remove("InstallPath");
        settings.sync();
        QCOMPARE(QString::fromStdString(CAppFolders::ResolveInstallFolder()),
                 dir.path() + "/data/Hearthbook");
        settings.setValue("InstallPath", dir.path() + "/configured/");
        settings.sync();
        QCOMPARE(QString::fromStdString(CAppFolders::ResolveInstallFolder()),
                 dir.path() + "/configured");
        qputenv("HEARTHBOOK_HOME", (dir.path() + "/env").toUtf8());
        const CAppFolders folders;
        QCOMPARE(QString::fromStdString(folders.GetInstallFolder()), dir.path() + "/env");
        QCOMPARE(QString::fromStdString(folders.GetDataFilePath()),
                 dir.path() + "/env/User Data/HearthbookInfo.hbi");
        QCOMPARE(QString::fromStdString(folders.GetImagesFolder()),
                 dir.path() + "/env/Data/Images");
        settings.remove("InstallPath");
        qputenv("HEARTHBOOK_HOME", savedHome);
        qputenv("XDG_DATA_HOME", savedData);
        if (savedHome.isEmpty())
            qunsetenv("HEARTHBOOK_HOME");
    }

    void creatingFolders()
    {
        QTemporaryDir dir;
        const CAppFolders folders((dir.path() + "/home").toStdString());
        QVERIFY(!folders.CreateFolders()); // one level only: the install folder is missing
        QVERIFY(CAppFolders::CreateFolderPath((dir.path() + "/home/").toStdString()));
        QVERIFY(folders.CreateFolders());
        QVERIFY(QDir(dir.path() + "/home/User Data").exists());
        QVERIFY(QDir(dir.path() + "/home/Archive").exists());

        QVERIFY(CAppFolders::CreateFolderPath((dir.path() + "/a/b/c/").toStdString()));
        QVERIFY(QDir(dir.path() + "/a/b/c").exists());
        QVERIFY(CAppFolders::CreateFolderPath((dir.path() + "/a/b/c").toStdString()));
        WriteFile(dir.path() + "/file", "x");
        QVERIFY(!CAppFolders::CreateFolderPath((dir.path() + "/file/sub/deeper").toStdString()));

        // The archive folder of a category is made one level deep.
        QCOMPARE(QString::fromStdString(folders.GetArchiveFolder("DOCUMENTS")),
                 dir.path() + "/home/Archive/DOCUMENTS");
        QVERIFY(QDir(dir.path() + "/home/Archive/DOCUMENTS").exists());
        folders.GetArchiveFolder("DOCUMENTS\\Letters\\2002");
        QVERIFY(!QDir(dir.path() + "/home/Archive/DOCUMENTS/Letters").exists());
    }

    void archiveMirrorsTheSourceFolder()
    {
        QTemporaryDir dir;
        const QString source = dir.path() + "/Photos/2003/Beach.jpg";
        WriteFile(source, "picture bytes");
        struct timespec times[2] = {{1000000000, 0}, {1000000000, 0}};
        QCOMPARE(::utimensat(AT_FDCWD, source.toLocal8Bit().constData(), times, 0), 0);
        const QString root = dir.path() + "/Archive/Pictures";
        const CFileEntry entry(root.toStdString(), source.toStdString());
        CScriptedPrompt prompt;

        const QString first =
            QString::fromStdString(entry.ArchiveFile(prompt, false, kJuly5At1407));
        QCOMPARE(first, root + dir.path() + "/Photos/2003/Beach-0307051407.jpg");
        QCOMPARE(ReadFile(first), QByteArray("picture bytes"));
        CFileStatus status;
        QVERIFY(CFileStatus::GetStatus(first.toStdString(), status));
        QCOMPARE(status.modifyTime, CTime(1000000000)); // the copy keeps the file's time
        QVERIFY(prompt.shown.empty());

        // Within the same minute the next copies are numbered; nothing is overwritten.
        const QString second =
            QString::fromStdString(entry.ArchiveFile(prompt, true, kJuly5At1407));
        QCOMPARE(second, root + dir.path() + "/Photos/2003/Beach-0307051407-2.jpg");
        QCOMPARE(QString::fromStdString(prompt.Only().text), "Archive picture file to:\r" + second);
        QCOMPARE(prompt.Only().caption, std::string("Archive File"));
        QCOMPARE(prompt.Only().icon, CPrompt::Icon::Information);
        QVERIFY(QString::fromStdString(entry.ArchiveFile(prompt, false, kJuly5At1407))
                    .endsWith("Beach-0307051407-3.jpg"));
        QCOMPARE(ReadFile(first), QByteArray("picture bytes"));
    }

    void archiveFailures_data()
    {
        QTest::addColumn<int>("situation");
        QTest::addColumn<QString>("text");
        QTest::addColumn<int>("icon");
        QTest::newRow("name without a dot")
            << 0 << "The file could not be located! Failed in copying file %2 to "
            << int(CPrompt::Icon::Stop);
        QTest::newRow("source missing")
            << 1 << "The file could not be located! Failed in copying file %2 to %3"
            << int(CPrompt::Icon::Stop);
        QTest::newRow("target folder cannot be made")
            << 2 << "Could not create %1, unable to archive file."
            << int(CPrompt::Icon::Exclamation);
    }

    void archiveFailures()
    {
        QFETCH(int, situation);
        QFETCH(QString, text);
        QFETCH(int, icon);
        QTemporaryDir dir;
        QString source = dir.path() + "/in/README";
        if (situation == 0)
            WriteFile(source, "text");
        if (situation == 1)
            source = dir.path() + "/in/gone.txt";
        QString root = dir.path() + "/Archive";
        if (situation == 2) {
            WriteFile(dir.path() + "/blocker", "x");
            root = dir.path() + "/blocker";
            source = dir.path() + "/in/a.txt";
        }
        const CFileEntry entry(root.toStdString(), source.toStdString());
        CScriptedPrompt prompt;
        QVERIFY(entry.ArchiveFile(prompt, true, kJuly5At1407).empty());
        const QString target = root + dir.path() + "/in";
        text = text.replace("%1", target)
                   .replace("%2", source)
                   .replace("%3", target + "/gone-0307051407.txt");
        QCOMPARE(QString::fromStdString(prompt.Only().text), text);
        QCOMPARE(prompt.Only().caption, std::string("Archive File"));
        QCOMPARE(int(prompt.Only().icon), icon);
    }

    void readWholeFile()
    {
        QTemporaryDir dir;
        WriteFile(dir.path() + "/f.bin", QByteArray("\0\1\2abc", 6));
        CScriptedPrompt prompt;
        CFileEntry entry((dir.path() + "/f.bin").toStdString());
        QVERIFY(entry.ReadWholeFile(prompt));
        QCOMPARE(entry.GetData(), std::string("\0\1\2abc", 6));
        CFileEntry missing(dir.path().toStdString(), "missing.bin");
        QVERIFY(!missing.ReadWholeFile(prompt));
        QVERIFY(prompt.shown.empty());
    }

    void scan()
    {
        QTemporaryDir dir;
        const QString d = dir.path();
        WriteFile(d + "/x.txt", "x");
        WriteFile(d + "/s/y.txt", "y");
        WriteFile(d + "/s/t/z.jpg", "z");
        QVERIFY(QFile::link(d, d + "/s/loop"));              // a link back up: not followed
        QVERIFY(QFile::link(d + "/x.txt", d + "/s/x-link")); // a link to a file: a file
        QVERIFY(QFile::link(d + "/nothing", d + "/dangling"));
        QCOMPARE(::mkfifo((d + "/pipe").toLocal8Bit().constData(), 0600), 0);
        QCOMPARE(ScanPaths(d, true), (QStringList{"s/t/z.jpg", "s/x-link", "s/y.txt", "x.txt"}));
        QCOMPARE(ScanPaths(d, false), QStringList{"x.txt"});
        QCOMPARE(ScanPaths(d + "/nowhere", true), QStringList{"<failed>"});

        CFileEntry entry(d.toStdString(), std::string());
        QVERIFY(entry.Scan(true));
        for (const CFileEntry& child : entry.GetChildren()) {
            if (child.GetName() == "z.jpg")
                QCOMPARE(QString::fromStdString(child.GetFolder()), d + "/s/t");
        }
    }

    void scanSkipsUnreadableFolders()
    {
        QTemporaryDir dir;
        WriteFile(dir.path() + "/a.txt", "a");
        WriteFile(dir.path() + "/closed/b.txt", "b");
        QFile::setPermissions(dir.path(), QFileDevice::Permissions(0x7777));
        QFile::setPermissions(dir.path() + "/closed", QFileDevice::Permissions());
        bool ok;
        if (::getuid() == 0) {
            // Root reads every folder, so the scan runs as an ordinary user.
            const pid_t child = ::fork();
            QVERIFY(child >= 0);
            if (child == 0) {
                const bool found = ::setgid(65534) == 0 && ::setuid(65534) == 0 &&
                                   ScanPaths(dir.path(), true) == QStringList{"a.txt"};
                ::_exit(found ? 0 : 1);
            }
            int status = 0;
            ::waitpid(child, &status, 0);
            ok = WIFEXITED(status) && WEXITSTATUS(status) == 0;
        } else {
            ok = ScanPaths(dir.path(), true) == QStringList{"a.txt"};
        }
        QFile::setPermissions(dir.path() + "/closed", QFileDevice::Permissions(0x7700));
        QVERIFY(ok);
    }
};

QTEST_GUILESS_MAIN(TestFolders)
#include "tst_folders.moc"
