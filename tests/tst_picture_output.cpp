// Pictures leaving the program: resized or converted for mail, the album
// mail, and pictures printed one to a page.

#include "catalog/app_context.h"
#include "catalog/document_set.h"
#include "catalog/picture_item.h"
#include "output/picture_mail.h"
#include "output/picture_pages.h"
#include "output/picture_resize.h"
#include "tests/support/scripted_prompt.h"

#include <QDir>
#include <QFile>
#include <QImage>
#include <QImageReader>
#include <QProcess>
#include <QTemporaryDir>
#include <QtTest>

namespace {

std::unique_ptr<CPictureItem> Picture(const QString& path, QSize size, QColor color,
                                      const QString& label)
{
    QImage image(size, QImage::Format_RGB32);
    image.fill(color);
    image.save(path);
    auto picture = std::make_unique<CPictureItem>();
    picture->SetPathname(path.toStdString());
    picture->SetOriginalPathname(path.toStdString());
    picture->SetLabel(label.toStdString());
    return picture;
}

QSize SizeOf(const QString& path)
{
    return QImageReader(path).size();
}

CPicResizeFields Fields(int mode, int width = 0, int height = 0, int location = 0)
{
    CPicResizeFields f;
    f.mode = mode;
    f.width = width;
    f.height = height;
    f.cropLocation = location;
    return f;
}

} // namespace

class TestPictureOutput : public QObject
{
    Q_OBJECT

    QTemporaryDir m_dir;

    QStringList Recorded()
    {
        QFile file(m_dir.path() + "/record");
        if (!file.open(QIODevice::ReadOnly))
            return {};
        QStringList args = QString::fromUtf8(file.readAll()).split(QChar('\0'));
        args.removeLast();
        file.remove();
        return args;
    }

private slots:
    void init()
    {
        qputenv("HEARTHBOOK_MAIL_COMMAND", HB_TEST_DATA "/mail-recorder.sh");
        qputenv("HB_MAIL_RECORD", (m_dir.path() + "/record").toLocal8Bit());
        QDir().mkpath(m_dir.path() + "/runtime");
        qputenv("XDG_RUNTIME_DIR", (m_dir.path() + "/runtime").toLocal8Bit());
    }

    void resizeModes_data()
    {
        QTest::addColumn<int>("mode");
        QTest::addColumn<int>("location");
        QTest::addColumn<QSize>("size");
        QTest::addColumn<QPoint>("sample"); // a pixel of the result that must be white
        QTest::newRow("scale") << 1 << 0 << QSize(100, 50) << QPoint(-1, -1);
        QTest::newRow("small halves") << 3 << 0 << QSize(320, 240) << QPoint(-1, -1);
        QTest::newRow("very small quarters") << 4 << 0 << QSize(160, 120) << QPoint(-1, -1);
        QTest::newRow("crop right bottom") << 2 << 2 << QSize(100, 100) << QPoint(99, 99);
        QTest::newRow("crop left top") << 2 << 4 << QSize(100, 100) << QPoint(0, 0);
    }

    void resizeModes()
    {
        QFETCH(int, mode);
        QFETCH(int, location);
        QFETCH(QSize, size);
        QFETCH(QPoint, sample);
        // A black picture with one white pixel in each corner.
        QImage image(640, 480, QImage::Format_RGB32);
        image.fill(Qt::black);
        for (const QPoint p : {QPoint(0, 0), QPoint(639, 0), QPoint(0, 479), QPoint(639, 479)})
            image.setPixel(p, qRgb(255, 255, 255));
        const QString path = m_dir.path() + "/corners.png";
        image.save(path);
        CPictureItem picture;
        picture.SetPathname(path.toStdString());
        QCOMPARE(ApplyResizeMode(picture, Fields(mode, 100, 50 * (mode == 2 ? 2 : 1), location)),
                 1);
        const QString out = m_dir.path() + "/out.png";
        QVERIFY(picture.SaveImageAs(out.toStdString()));
        const QImage result(out);
        QCOMPARE(result.size(), size);
        if (sample.x() >= 0)
            QCOMPARE(result.pixel(sample), qRgb(255, 255, 255));
    }

    void cropOffsets()
    {
        const CCropOffset at = CropOffset(CPicResizeFields::RightBottom, 640, 480, 100, 100);
        QCOMPARE(QPoint(at.x, at.y), QPoint(540, 380));
        const CCropOffset centre = CropOffset(CPicResizeFields::Center, 640, 480, 101, 100);
        QCOMPARE(QPoint(centre.x, centre.y), QPoint(269, 190));
    }

    void pictureMailConvertsCopies()
    {
        const auto green = Picture(m_dir.path() + "/green.jpg", {640, 480}, Qt::green, "Green");
        CScriptedPrompt prompt;
        prompt.QueueAnswer(CPrompt::Answer::Yes);
        prompt.resizePictures.push_back([](CPicResizeFields& f) {
            f = Fields(CPicResizeFields::Small);
            f.convert = true;
            f.pictureType = "png";
            return true;
        });
        QVERIFY(MailPictures(prompt, {green.get()}));
        QCOMPARE(prompt.Only().caption, std::string("Mail Photo Album"));
        QCOMPARE(prompt.Only().buttons, CPrompt::Buttons::YesNo);
        const QString converted = QString::fromStdString(MailWorkFolder()) + "/green.png";
        QCOMPARE(Recorded(), (QStringList{"--subject", "", "--body", " ", "--attach", converted}));
        QCOMPARE(SizeOf(converted), QSize(320, 240));
        // The catalog's picture and its file are as they were.
        QCOMPARE(green->GetImageWidth(), 640);
        QCOMPARE(SizeOf(m_dir.path() + "/green.jpg"), QSize(640, 480));

        prompt.shown.clear(); // No: the files themselves are attached
        QVERIFY(MailPictures(prompt, {green.get()}));
        QCOMPARE(Recorded().last(), m_dir.path() + "/green.jpg");

        qputenv("HEARTHBOOK_MAIL_COMMAND", "hearthbook-no-such-mail-program");
        prompt.shown.clear();
        QVERIFY(!MailPictures(prompt, {green.get()}));
        QCOMPARE(prompt.Only().caption, std::string("Send Mail"));
    }

    void albumMail()
    {
        const auto green = Picture(m_dir.path() + "/g.jpg", {400, 300}, Qt::green, "G");
        CPhotoAlbum album;
        album.SetTitle("Summer 2003");
        album.SetDescription("Our trip");
        album.GetMembers().Append(std::make_shared<CDocumentItem>(*green));
        CScriptedPrompt prompt;
        CAppContext context(prompt, CAppFolders(m_dir.path().toStdString()));
        album.Mail(context);
        const QString folder = QString::fromStdString(MailWorkFolder());
        QCOMPARE(Recorded(),
                 (QStringList{"--subject", "", "--body",
                              "Our trip\n\n\n\nHint for saving Photo Album attachments:\n\n1. Open "
                              "this mail item.\n2. Select all of the attachments, by holding down "
                              "<Shift>click all attachment.\n3. On File menu, select the Save "
                              "Attachments command.\n4. To run, double<click> on file "
                              "Summer.html   ",
                              "--attach", folder + "/Pic_0001.jpg", "--attach",
                              folder + "/Page_000.html", "--attach", folder + "/Summer.html"}));

        prompt.QueueAnswer(CPrompt::Answer::Yes);
        prompt.resizePictures.push_back([](CPicResizeFields& f) {
            f = Fields(CPicResizeFields::VerySmall);
            return true;
        });
        album.Mail(context);
        QVERIFY(Recorded().contains(folder + "/Pic_0001.jpg"));
        QCOMPARE(SizeOf(folder + "/Pic_0001.jpg"), QSize(100, 75)); // pages are sent as they are
    }

    void printsOnePictureAPage()
    {
        const auto green = Picture(m_dir.path() + "/p1.png", {400, 300}, Qt::green, "Green one");
        const auto blue = Picture(m_dir.path() + "/p2.png", {300, 400}, Qt::blue, "Blue two");
        CScriptedPrompt prompt;
        const QString pdf = m_dir.path() + "/pictures.pdf";
        prompt.pdfAnswers.push_back(pdf.toStdString());
        QVERIFY(PrintPictures(prompt, {green.get(), blue.get()}));
        QVERIFY(prompt.shown.empty());
        QCOMPARE(green->GetWhiteBorder(), 0); // the catalog's picture keeps its flags
        QProcess render;
        render.start("pdftoppm", {"-r", "30", "-png", pdf, m_dir.path() + "/page"});
        QVERIFY(render.waitForFinished(60000));
        const QImage first(m_dir.path() + "/page-1.png");
        const QImage second(m_dir.path() + "/page-2.png");
        QVERIFY(!first.isNull() && !second.isNull());
        QVERIFY(!QFile::exists(m_dir.path() + "/page-3.png"));
        const QPoint centre(first.width() / 2, first.height() / 3);
        QCOMPARE(QColor(first.pixel(centre)).green() > 200 && qRed(first.pixel(centre)) < 60, true);
        QCOMPARE(qBlue(second.pixel(centre)) > 200 && qGreen(second.pixel(centre)) < 60, true);
        QProcess text;
        text.start("pdftotext", {pdf, "-"});
        QVERIFY(text.waitForFinished(60000));
        const QByteArray words = text.readAllStandardOutput();
        QVERIFY(words.contains("Green one") && words.contains("Blue two"));
    }

    void pageCells_data()
    {
        QTest::addColumn<int>("perPage");
        QTest::addColumn<QRect>("last");
        QTest::newRow("one") << 1 << QRect(QPoint(10, 10), QPoint(589, 549));
        QTest::newRow("two rows") << 2 << QRect(QPoint(10, 305), QPoint(589, 549));
        QTest::newRow("six") << 6 << QRect(QPoint(310, 402), QPoint(589, 547));
        QTest::newRow("seven is six") << 7 << QRect(QPoint(310, 402), QPoint(589, 547));
    }

    void pageCells()
    {
        QFETCH(int, perPage);
        QFETCH(QRect, last);
        const auto cells = PicturePageCells(QRect(0, 0, 614, 614), QSize(600, 590), perPage);
        QCOMPARE(cells.back(), last);
    }
};

QTEST_MAIN(TestPictureOutput)
#include "tst_picture_output.moc"
