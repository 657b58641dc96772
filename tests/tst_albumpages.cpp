// Photo album web pages: page and file lists, navigation, captions, the
// picture counter, index names and the thumbnail fit rule.

#include "catalog/document_set.h"
#include "output/album_pages.h"
#include "output/html_page.h"
#include "tests/support/scripted_prompt.h"

#include <QDir>
#include <QFile>
#include <QImage>
#include <QTemporaryDir>
#include <QtTest>

namespace {

class AlbumFixture
{
public:
    // count pictures of 400 x 300, captioned "Cap 1", "Cap 2" ...
    AlbumFixture(int count, int perPage, bool captions, const QString& extension = "png")
    {
        album.SetTitle("Summer 2003");
        album.SetPicturesPerPage(perPage);
        album.SetDisplayCaption(captions ? 1 : 0);
        album.SetThumbnailSize(1);
        album.SetBackgroundColor(0x0000FF); // red
        QDir().mkpath(dir.path() + "/src");
        for (int i = 1; i <= count; ++i)
            AddPicture(QString("p%1.%2").arg(i).arg(extension), "Cap " + QString::number(i));
    }

    std::shared_ptr<CDocumentItem> AddPicture(const QString& name, const QString& caption,
                                              QSize size = QSize(400, 300))
    {
        const QString path = dir.path() + "/src/" + name;
        QImage image(size, QImage::Format_RGB32);
        image.fill(Qt::green);
        image.save(path, "PNG");
        auto member = std::make_shared<CDocumentItem>();
        member->SetPathname(path.toStdString());
        member->SetOriginalPathname(path.toStdString());
        member->SetLabel(caption.toStdString());
        album.GetMembers().Append(member);
        return member;
    }

    bool Create(int* failed = nullptr)
    {
        CWebSite site(Out().toStdString());
        return album.CreateWebPages(site, Out().toStdString(), failed);
    }

    QString Out() const { return dir.path() + "/out"; }

    QByteArray Page(int i) const
    {
        QFile file(Out() + QString("/Page_%1.html").arg(i, 3, 10, QChar('0')));
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray("<missing>");
    }

    QStringList Generated() const
    {
        QStringList names;
        for (const auto& item : album.GetGeneratedFiles())
            names << QFileInfo(QString::fromStdString(item->GetPathname())).fileName();
        return names;
    }

    QTemporaryDir dir;
    CPhotoAlbum album;
};

QByteArray Image(const char* name, int width, int height)
{
    return QByteArray("\n<td align=center bgcolor=white><image width = ") +
           QByteArray::number(width) + " height = " + QByteArray::number(height) + " name=" + name +
           " src=" + name + " bgcolor=white>\n</td>";
}

QByteArray Caption(const char* text)
{
    return QByteArray("\n<td align=center bgcolor=#ff0000>") + text + "\n</td>";
}

const QByteArray kEmptyNav = "\n<td align=center bgcolor=#ff0000>\n</td>";

QByteArray Link(const char* text, const char* href)
{
    return QByteArray("\n<td align=center bgcolor=#ff0000><a href=") + href + ">" + text +
           "\n</td>";
}

} // namespace

class TestAlbumPages : public QObject
{
    Q_OBJECT

private slots:
    void fivePicturesTwoPerPage()
    {
        AlbumFixture f(5, 2, false);
        QVERIFY(f.Create());
        QCOMPARE(f.album.GetColumns(), 2);
        QCOMPARE(f.Generated(), (QStringList{"Pic_0001.png", "Pic_0002.png", "Page_000.html",
                                             "Pic_0003.png", "Pic_0004.png", "Page_001.html",
                                             "Pic_0005.png", "Page_002.html", "Summer.html"}));
        QCOMPARE(QString::fromStdString(f.album.GetIndexPath()), f.Out() + "/Summer.html");
        QCOMPARE(QString::fromStdString(f.album.GetIndexFileName()), QString("Summer.html"));
        QVERIFY(QFile::exists(f.Out() + "/Pic_0005.png"));
        QVERIFY(f.Page(0).contains("\n<tr>" + Image("Pic_0001.png", 200, 150) +
                                   Image("Pic_0002.png", 200, 150) + "\n</tr>\n<tr>" + kEmptyNav +
                                   Link("Next", "Page_001.html") + "\n</tr>\n</table>"));
        QVERIFY(
            f.Page(1).contains(Link("Previous", "Page_000.html") + Link("Next", "Page_002.html")));
        QVERIFY(f.Page(2).contains("\n<tr>" + Image("Pic_0005.png", 200, 150) + "\n</tr>\n<tr>" +
                                   Link("Previous", "Page_001.html") + kEmptyNav + "\n</tr>"));
        QVERIFY(f.Page(0).contains("<BODY bgcolor=#ff0000 >"));
        QFile index(f.Out() + "/Summer.html");
        QVERIFY(index.open(QIODevice::ReadOnly));
        QVERIFY(index.readAll().endsWith("\n<Frameset>\n<Frame src=\"Page_000.html\", "
                                         "name=Page_000.html>\n</Frameset>\n</HTML>"));
    }

    void captionsWaitForAFullRow()
    {
        // Three a page in two columns: the third picture's caption leads the
        // next page's first caption row.
        AlbumFixture f(5, 3, true);
        QVERIFY(f.Create());
        QVERIFY(f.Page(0).contains(Image("Pic_0002.png", 200, 150) + "\n</tr>\n<tr>" +
                                   Caption("Cap 1") + Caption("Cap 2") + "\n</tr>\n<tr>" +
                                   Image("Pic_0003.png", 200, 150) + "\n</tr>\n<tr>" + kEmptyNav));
        QVERIFY(f.Page(1).contains(Image("Pic_0005.png", 200, 150) + "\n</tr>\n<tr>" +
                                   Caption("Cap 3") + Caption("Cap 4") + Caption("Cap 5") +
                                   "\n</tr>"));
    }

    void onePerPageIsOneColumn()
    {
        AlbumFixture f(2, 1, true);
        QVERIFY(f.Create());
        QCOMPARE(f.album.GetColumns(), 1);
        QVERIFY(f.Page(1).contains("\n<tr>" + Image("Pic_0002.png", 200, 150) + "\n</tr>\n<tr>" +
                                   Caption("Cap 2") + "\n</tr>\n<tr>" +
                                   Link("Previous", "Page_000.html") + kEmptyNav));
    }

    void counterRunsOverPagesAndExtensions()
    {
        AlbumFixture f(5, 4, false);
        f.AddPicture("photo.jpeg", "jpeg");
        f.AddPicture("scan.TIF", "tif");
        QVERIFY(f.Create());
        QVERIFY(f.Page(1).contains("\n<tr>" + Image("Pic_0005.png", 200, 150)));
        QVERIFY(f.Generated().contains("Pic_0006.")); // four letters after the dot: none kept
        QVERIFY(f.Generated().contains("Pic_0007.TIF"));
        QVERIFY(QFile::exists(f.Out() + "/Pic_0006."));
    }

    void emptyAlbumWritesOnlyTheIndex()
    {
        AlbumFixture f(0, 2, true);
        QVERIFY(f.Create());
        QCOMPARE(f.Generated(), QStringList{"Summer.html"});
        QCOMPARE(QDir(f.Out()).entryList(QDir::Files), QStringList{"Summer.html"});
    }

    void indexNames_data()
    {
        QTest::addColumn<QString>("title");
        QTest::addColumn<QString>("index");
        QTest::newRow("first word") << "Summer 2003"
                                    << "Summer.html";
        QTest::newRow("one word") << "Vacation"
                                  << "Title.html";
        QTest::newRow("empty") << ""
                               << "Title.html";
        QTest::newRow("leading blank") << " Summer"
                                       << "Title.html";
        QTest::newRow("climbing") << "../../x y"
                                  << "_._.._x.html";
        QTest::newRow("hidden") << ".profile y"
                                << "_profile.html";
    }

    void indexNames()
    {
        QFETCH(QString, title);
        QFETCH(QString, index);
        QCOMPARE(QString::fromStdString(AlbumIndexBaseName(title.toStdString())) + ".html", index);
    }

    void fitRule_data()
    {
        QTest::addColumn<int>("size");
        QTest::addColumn<QSize>("picture");
        QTest::addColumn<QSize>("cell");
        QTest::newRow("large box, wide picture") << 2 << QSize(1000, 500) << QSize(250, 126);
        QTest::newRow("both sides over") << 1 << QSize(400, 300) << QSize(200, 150);
        QTest::newRow("small picture grows") << 0 << QSize(50, 20) << QSize(150, 60);
        QTest::newRow("exactly as wide") << 1 << QSize(200, 100) << QSize(200, 200);
        QTest::newRow("too tall") << 1 << QSize(100, 300) << QSize(66, 200);
        QTest::newRow("too wide") << 1 << QSize(300, 100) << QSize(200, 66);
        QTest::newRow("odd unused height") << 1 << QSize(300, 101) << QSize(200, 68);
        QTest::newRow("unknown thumbnail size is medium")
            << 7 << QSize(400, 300) << QSize(200, 150);
        QTest::newRow("unreadable picture fills the box") << 1 << QSize(0, 0) << QSize(200, 200);
    }

    void fitRule()
    {
        QFETCH(int, size);
        QFETCH(QSize, picture);
        QFETCH(QSize, cell);
        const CThumbnailBox fitted =
            AlbumThumbnailSize(picture.width(), picture.height(), AlbumThumbnailBox(size));
        QCOMPARE(QSize(fitted.width, fitted.height), cell);
    }

    void userTextIsEscaped()
    {
        AlbumFixture f(2, 2, true);
        f.album.SetTitle("<i>Trip</i> & more");
        f.album.GetMembers().at(0)->SetLabel("<script>");
        QVERIFY(f.Create());
        QVERIFY(f.Page(0).contains(Caption("&lt;script&gt;")));
        QVERIFY(f.Page(0).contains("&lt;i&gt;Trip&lt;/i&gt; &amp; more"));
        QVERIFY(!f.Page(0).contains("<script>"));
    }

    void saveCommandMessages()
    {
        AlbumFixture f(2, 2, false);
        const auto missing = f.AddPicture("gone.png", "Gone");
        QFile::remove(QString::fromStdString(missing->GetPathname()));
        CScriptedPrompt prompt;
        QVERIFY(!SaveAlbumWebPages(prompt, f.album)); // folder dialog cancelled
        QCOMPARE(prompt.Only().text, std::string("Unable to save Photo Album Web Pages!"));
        QCOMPARE(prompt.Only().caption, std::string("Save Photo Album"));
        QCOMPARE(prompt.Only().icon, CPrompt::Icon::Stop);
        prompt.shown.clear();
        prompt.folderAnswers.push_back(f.Out().toStdString());
        QVERIFY(SaveAlbumWebPages(prompt, f.album));
        // The pages are still written; the missing copy is counted.
        QCOMPARE(prompt.Only().text, std::string("Successfully saved Photo Album Web Pages!\n"
                                                 "1 picture(s) could not be copied."));
        QVERIFY(f.Page(1).contains("Pic_0003.png"));
        prompt.shown.clear();
        QFile::remove(QString::fromStdString(missing->GetOriginalPathname()));
        f.album.GetMembers().RemoveAt(2);
        QVERIFY(SaveAlbumWebPages(prompt, f.album, f.Out().toStdString()));
        QCOMPARE(prompt.Only().text, std::string("Successfully saved Photo Album Web Pages!"));
        QCOMPARE(prompt.Only().icon, CPrompt::Icon::Information);
    }

    void folderThatCannotBeMade()
    {
        AlbumFixture f(1, 2, false);
        QFile blocker(f.dir.path() + "/blocker");
        QVERIFY(blocker.open(QIODevice::WriteOnly));
        CWebSite site((blocker.fileName() + "/x").toStdString());
        QVERIFY(!f.album.CreateWebPages(site, (blocker.fileName() + "/x").toStdString()));
        QVERIFY(f.album.GetGeneratedFiles().empty());
    }
};

QTEST_MAIN(TestAlbumPages)
#include "tst_albumpages.moc"
