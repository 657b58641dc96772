// Catalog items: constructors and copy rules, item lists, and every record
// written and read back through the stream.

#include "catalog/archive.h"
#include "catalog/catalog_items.h"
#include "tests/support/hex_fixture.h"

#include <QtTest>

namespace {

template <typename Item>
std::string Store(Item& item, int version = 6)
{
    std::string out;
    CArchive ar(&out);
    if constexpr (std::is_base_of_v<CDocumentItem, Item> || std::is_base_of_v<CDocumentSetBase, Item>)
        item.SerializeVersioned(ar, version);
    else
        item.Serialize(ar);
    return out;
}

template <typename Item>
void Load(Item& item, const std::string& bytes, int version = 6)
{
    CArchive ar{std::string_view(bytes)};
    if constexpr (std::is_base_of_v<CDocumentItem, Item> || std::is_base_of_v<CDocumentSetBase, Item>)
        item.SerializeVersioned(ar, version);
    else
        item.Serialize(ar);
    QCOMPARE(ar.BytesLeft(), 0);
}

void FillCommon(CCatalogItem& item, int seed)
{
    item.SetName("name " + std::to_string(seed));
    item.SetCategoryPath("DOCUMENTS\\Sub " + std::to_string(seed));
    item.SetKeyword1("k1-" + std::to_string(seed));
    item.SetKeyword2("k2-" + std::to_string(seed));
    item.SetFlagA(seed * 3);
    item.SetFlagB(seed * 5);
    item.SetCreateDate(CTime(1000000 + seed));
    item.SetUpdateDate(CTime(2000000 + seed));
    item.SetDocumentNumber(0x100000000ll + seed);
}

void CompareCommon(const CCatalogItem& a, const CCatalogItem& b)
{
    QCOMPARE(a.GetName(), b.GetName());
    QCOMPARE(a.GetKindTag(), b.GetKindTag());
    QCOMPARE(a.GetCategoryPath(), b.GetCategoryPath());
    QCOMPARE(a.GetKeyword1(), b.GetKeyword1());
    QCOMPARE(a.GetKeyword2(), b.GetKeyword2());
    QCOMPARE(a.GetFlagA(), b.GetFlagA());
    QCOMPARE(a.GetFlagB(), b.GetFlagB());
    QCOMPARE(a.GetCreateDate(), b.GetCreateDate());
    QCOMPARE(a.GetUpdateDate(), b.GetUpdateDate());
    QCOMPARE(a.GetDocumentNumber(), b.GetDocumentNumber());
}

void FillDocument(CDocumentItem& d, int seed)
{
    FillCommon(d, seed);
    d.SetPathname("/home/ann/file" + std::to_string(seed) + ".txt");
    d.SetOriginalPathname("/media/card/file" + std::to_string(seed) + ".txt");
    d.SetLabel("label " + std::to_string(seed));
    d.SetDocumentCategoryPath("DOCUMENTS\\Letters");
    d.SetFileCreateDate(CTime(3000000 + seed));
    d.SetFileModifyDate(CTime(-4000000 - seed));
    d.SetFileSize(0xFFFFFFFFFull + static_cast<uint64_t>(seed));
    d.SetIntC(seed + 1);
    d.SetIntD(seed + 2);
    d.SetIntE(seed + 3);
}

void CompareDocument(const CDocumentItem& a, const CDocumentItem& b, bool withInts = true)
{
    CompareCommon(a, b);
    QCOMPARE(a.GetPathname(), b.GetPathname());
    QCOMPARE(a.GetOriginalPathname(), b.GetOriginalPathname());
    QCOMPARE(a.GetLabel(), b.GetLabel());
    QCOMPARE(a.GetDocumentCategoryPath(), b.GetDocumentCategoryPath());
    QCOMPARE(a.GetFileCreateDate(), b.GetFileCreateDate());
    QCOMPARE(a.GetFileModifyDate(), b.GetFileModifyDate());
    QCOMPARE(a.GetFileSize(), b.GetFileSize());
    if (withInts) {
        QCOMPARE(a.GetIntC(), b.GetIntC());
        QCOMPARE(a.GetIntD(), b.GetIntD());
        QCOMPARE(a.GetIntE(), b.GetIntE());
    }
}

} // namespace

class TestItems : public QObject
{
    Q_OBJECT

private slots:
    void labelFromPath_data()
    {
        QTest::addColumn<QString>("path");
        QTest::addColumn<QString>("label");
        QTest::newRow("with extension") << "/a/letter.doc" << "letter";
        QTest::newRow("no extension loses four characters") << "/a/readme" << "re";
        QTest::newRow("relative") << "readme.txt" << "readme";
        QTest::newRow("four characters") << "a.tx" << "";
        QTest::newRow("top folder") << "/x.doc" << "x";
        QTest::newRow("dot in folder") << "/pics.old/photo.jpeg" << "photo.";
    }

    void labelFromPath()
    {
        QFETCH(QString, path);
        QFETCH(QString, label);
        CFileStatus status;
        status.size = 12;
        status.createTime = CTime(100);
        status.modifyTime = CTime(200);
        status.accessTime = CTime(300);
        const CDocumentItem d(path.toStdString(), status);
        QCOMPARE(QString::fromStdString(d.GetLabel()), label);
        QCOMPARE(QString::fromStdString(d.GetPathname()), path);
        QCOMPARE(QString::fromStdString(d.GetOriginalPathname()), path);
        QCOMPARE(d.GetFileCreateDate(), CTime(100));
        QCOMPARE(d.GetFileModifyDate(), CTime(200));
        QCOMPARE(d.GetFileSize(), uint64_t(12));
    }

    void constructorDefaults()
    {
        const CTime before = CTime::GetCurrentTime();
        const CDocumentItem d;
        QCOMPARE(d.GetIntC(), 0);
        QCOMPARE(d.GetIntD(), -1);
        QCOMPARE(d.GetIntE(), -1);
        QCOMPARE(d.GetManagedFlag(), 1);
        QCOMPARE(d.GetFlagB(), 1);
        QCOMPARE(d.GetDocumentNumber(), 0);
        QVERIFY(d.GetUpdateDate() >= before); // documents start updated now
        QVERIFY(d.GetKindTag().empty());

        const CEventItem e;
        QCOMPARE(e.GetKindTag(), std::string("EVENT"));
        QCOMPARE(e.GetUpdateDate(), CTime()); // other kinds start with zero
        QVERIFY(e.GetCreateDate() >= before);
        const CRecipeItem r;
        QCOMPARE(r.GetKindTag(), std::string("RECIPE"));
        QCOMPARE(r.GetPrintLineCount(), 30);

        const CDocumentSet s;
        QCOMPARE(s.GetKindTag(), std::string("DOCUMENT SETS"));
        QCOMPARE(s.GetCategoryPath(), std::string("DOCUMENT SETS"));
        QCOMPARE(s.GetAlbumFlag(), 0);

        const CPhotoAlbum a;
        QCOMPARE(a.GetAlbumFlag(), 1);
        QCOMPARE(a.GetPicturesPerPage(), 6);
        QCOMPARE(a.GetColumns(), 2);
        QCOMPARE(a.GetDisplayCaption(), 1);
        QCOMPARE(a.GetThumbnailSize(), 2);
        QCOMPARE(a.GetDisplayType(), 1);
        QCOMPARE(a.GetBackgroundColor(), 0xFFFFFFu);
    }

    void setCopiesAndAlbumFromSet()
    {
        CDocumentSet set;
        FillCommon(set, 4);
        set.SetKindTag("DOCUMENT SETS");
        set.SetLabel("Taxes");
        set.SetDescription("All the\r\ntax papers");
        set.SetSequenceNumber(17);
        set.GetMembers().Append(std::make_shared<CDocumentItem>());

        const CDocumentSet copy(set);
        QCOMPARE(copy.GetName(), std::string("Taxes")); // the name is the other's label
        QCOMPARE(copy.GetDescription(), set.GetDescription());
        QCOMPARE(copy.GetKeyword1(), set.GetKeyword1());
        QCOMPARE(copy.GetCategoryPath(), set.GetCategoryPath());
        QCOMPARE(copy.GetDocumentNumber(), set.GetDocumentNumber());
        QCOMPARE(copy.GetSequenceNumber(), 17);
        QVERIFY(copy.GetMembers().empty());

        const CPhotoAlbum album(set);
        QCOMPARE(album.GetAlbumFlag(), 0);
        QCOMPARE(album.GetThumbnailSize(), 1);
        QCOMPARE(album.GetPicturesPerPage(), 6);
        QVERIFY(album.GetTitle().empty());
    }

    void baseCopyLeavesCountsAlone()
    {
        auto a = std::make_shared<CDocumentItem>();
        FillDocument(*a, 2);
        a->SetSequenceNumber(5);
        a->SetPrintPage(3);
        CItemList holder;
        holder.Append(a);
        CDocumentItem b(*a);
        CompareDocument(*a, b);
        QCOMPARE(b.GetSequenceNumber(), 5);
        QCOMPARE(b.GetPrintPage(), 0);
        QCOMPARE(b.GetRefCount(), 0);
    }

    void pictureFromDocument()
    {
        CDocumentItem d;
        FillDocument(d, 9);
        d.SetSequenceNumber(44);
        d.SetManagedFlag(0);
        const CTime before = CTime::GetCurrentTime();
        const CPictureItem p(d);
        QCOMPARE(p.GetLabel(), d.GetLabel());
        QCOMPARE(p.GetPathname(), d.GetPathname());
        QCOMPARE(p.GetOriginalPathname(), d.GetOriginalPathname());
        QCOMPARE(p.GetDocumentCategoryPath(), d.GetDocumentCategoryPath());
        QCOMPARE(p.GetCategoryPath(), d.GetCategoryPath());
        QCOMPARE(p.GetFileSize(), d.GetFileSize());
        QCOMPARE(p.GetFileCreateDate(), d.GetFileCreateDate());
        QCOMPARE(p.GetFileModifyDate(), d.GetFileModifyDate());
        QCOMPARE(p.GetCreateDate(), d.GetCreateDate());
        QCOMPARE(p.GetSequenceNumber(), 44);
        QCOMPARE(p.GetKeyword1(), d.GetKeyword1());
        QCOMPARE(p.GetKeyword2(), d.GetKeyword2());
        QCOMPARE(p.GetManagedFlag(), 0);
        // Not taken: the name, the document number and the stored ints.
        QVERIFY(p.GetName().empty());
        QCOMPARE(p.GetDocumentNumber(), 0);
        QCOMPARE(p.GetIntC(), 0);
        QVERIFY(p.GetUpdateDate() >= before);
        QVERIFY(p.IsPicture());
    }

    void itemLivesUntilTheLastListLetsGo()
    {
        std::weak_ptr<CDocumentItem> watch;
        auto first = std::make_unique<CItemList>();
        auto second = std::make_unique<CItemList>();
        {
            auto item = std::make_shared<CDocumentItem>();
            watch = item;
            first->Append(item);
            second->Append(item);
            QCOMPARE(item->GetRefCount(), 2);
        }
        first.reset();
        QVERIFY(!watch.expired());
        QCOMPARE(watch.lock()->GetRefCount(), 1);
        QVERIFY(second->Remove(watch.lock().get()));
        QVERIFY(watch.expired());
    }

    void setAssignmentSharesMembers()
    {
        CPhotoAlbum album;
        FillCommon(album, 1);
        album.SetDescription("d");
        album.SetLabel("L");
        auto member = std::make_shared<CDocumentItem>();
        album.GetMembers().Append(member);
        CDocumentSet set;
        set.AssignFrom(album);
        CompareCommon(set, album);
        QCOMPARE(set.GetAlbumFlag(), 1);
        QCOMPARE(set.GetMembers().at(0).get(), member.get());
        QCOMPARE(member->GetRefCount(), 2);
    }

    void documentRoundTrip_data()
    {
        QTest::addColumn<bool>("picture");
        QTest::newRow("document") << false;
        QTest::newRow("picture") << true;
    }

    void documentRoundTrip()
    {
        QFETCH(bool, picture);
        std::unique_ptr<CDocumentItem> out(picture ? new CPictureItem : new CDocumentItem);
        std::unique_ptr<CDocumentItem> in(picture ? new CPictureItem : new CDocumentItem);
        FillDocument(*out, 7);
        Load(*in, Store(*out));
        CompareDocument(*out, *in);
    }

    void formatFiveDocumentHasNoStoredInts()
    {
        CDocumentItem out;
        FillDocument(out, 3);
        const std::string six = Store(out, 6);
        const std::string five = Store(out, 5);
        QCOMPARE(six.size(), five.size() + 12);
        CDocumentItem in;
        Load(in, five, 5);
        CompareDocument(out, in, false);
        QCOMPARE(in.GetIntC(), 0);
        QCOMPARE(in.GetIntD(), -1);
        QCOMPARE(in.GetIntE(), -1);
    }

    void eventRoundTrip()
    {
        CEventItem out;
        FillCommon(out, 5);
        out.SetEventName("Birthday");
        out.SetLocation("Home");
        out.SetOccasion("Ann turns 40");
        out.SetComments("Cake\r\nGames\r\n");
        out.SetStartDate(CTime(-5));
        out.SetEndDate(CTime(0x3F000000));
        out.GetAttendees().emplace_back("Ann");
        out.GetAttendees().emplace_back("");
        CEventItem in;
        Load(in, Store(out));
        CompareCommon(out, in);
        QCOMPARE(in.GetEventName(), out.GetEventName());
        QCOMPARE(in.GetLocation(), out.GetLocation());
        QCOMPARE(in.GetOccasion(), out.GetOccasion());
        QCOMPARE(in.GetComments(), out.GetComments());
        QCOMPARE(in.GetStartDate(), out.GetStartDate());
        QCOMPARE(in.GetEndDate(), out.GetEndDate());
        QCOMPARE(in.GetAttendees().size(), size_t(2));
        QCOMPARE(in.GetAttendees()[0].GetName(), std::string("Ann"));
        QVERIFY(in.GetAttendees()[1].GetName().empty());
    }

    void emptyCommentsAndNoIngredientsWriteOnlyTheirInt()
    {
        CEventItem event;
        const std::string e = Store(event);
        // three empty lines, then the comments' length 0 and no bytes
        QCOMPARE(QByteArray::fromStdString(e.substr(0, 7)), ParseHexFixture("0A 0A 0A 00 00 00 00"));
        CRecipeItem recipe;
        const std::string r = Store(recipe);
        // two empty lines, directions length 0, ingredient count 0, then the common record
        QCOMPARE(QByteArray::fromStdString(r.substr(0, 10)),
                 ParseHexFixture("0A 0A 00 00 00 00 00 00 00 00"));
        QCOMPARE(r.substr(10, 1), std::string("\n")); // the common record's name
    }

    void recipeRoundTrip()
    {
        CRecipeItem out;
        FillCommon(out, 6);
        out.SetDish("Pancakes");
        out.SetAuthor("Ann");
        out.SetDirections("Mix.\r\nFry.");
        out.GetIngredients().emplace_back("2", "cups", "flour");
        out.GetIngredients().emplace_back("", "", "salt");
        CRecipeItem in;
        Load(in, Store(out));
        CompareCommon(out, in);
        QCOMPARE(in.GetDish(), out.GetDish());
        QCOMPARE(in.GetAuthor(), out.GetAuthor());
        QCOMPARE(in.GetDirections(), out.GetDirections());
        QCOMPARE(in.GetIngredients().size(), size_t(2));
        QCOMPARE(in.GetIngredients()[0].GetAmount(), std::string("2"));
        QCOMPARE(in.GetIngredients()[0].GetMeasurement(), std::string("cups"));
        QCOMPARE(in.GetIngredients()[1].GetIngredient(), std::string("salt"));
    }

    void albumRoundTrip()
    {
        CPhotoAlbum out;
        FillCommon(out, 8);
        out.SetLabel("Trip");
        out.SetDescription("Our trip\r\nto the sea");
        out.SetBackgroundColor(0x123456);
        out.SetPicturesPerPage(4);
        out.SetColumns(3);
        out.SetDisplayCaption(0);
        out.SetThumbnailSize(0);
        out.SetDisplayType(0);
        out.SetTitle(std::string(300, 'T'));
        for (int i = 0; i < 3; ++i) {
            auto member = std::make_shared<CDocumentItem>();
            FillDocument(*member, 20 + i);
            out.GetMembers().Append(member);
        }
        const std::string bytes = Store(out);
        // A title of 255 characters or more takes 0xFF and a two-byte length.
        QCOMPARE(QByteArray::fromStdString(bytes.substr(bytes.size() - 303, 3)),
                 ParseHexFixture("FF 2C 01"));
        CPhotoAlbum in;
        Load(in, bytes);
        CompareCommon(out, in);
        QCOMPARE(in.GetLabel(), out.GetLabel());
        QCOMPARE(in.GetDescription(), out.GetDescription());
        QCOMPARE(in.GetAlbumFlag(), 1);
        QCOMPARE(in.GetBackgroundColor(), 0x123456u);
        QCOMPARE(in.GetPicturesPerPage(), 4);
        QCOMPARE(in.GetColumns(), 3);
        QCOMPARE(in.GetDisplayCaption(), 0);
        QCOMPARE(in.GetThumbnailSize(), 0);
        QCOMPARE(in.GetDisplayType(), 0);
        QCOMPARE(in.GetTitle(), out.GetTitle());
        QCOMPARE(in.GetMembers().size(), size_t(3));
        for (int i = 0; i < 3; ++i) {
            CompareDocument(*out.GetMembers().at(i), *in.GetMembers().at(i));
            QCOMPARE(in.GetMembers().at(i)->GetSequenceNumber(), i + 1);
        }
    }

    void descriptionLengths_data()
    {
        QTest::addColumn<QByteArray>("description");
        QTest::addColumn<QByteArray>("written");
        QTest::addColumn<QByteArray>("readBack");
        QTest::newRow("empty") << QByteArray() << ParseHexFixture("00 00 00 00") << QByteArray();
        QTest::newRow("one character keeps a blank")
            << QByteArray("x") << ParseHexFixture("02 00 00 00 \"x \"") << QByteArray("x ");
        QTest::newRow("two characters") << QByteArray("\r\n") << ParseHexFixture("02 00 00 00 0D 0A")
                                        << QByteArray("\r\n");
    }

    void descriptionLengths()
    {
        QFETCH(QByteArray, description);
        QFETCH(QByteArray, written);
        QFETCH(QByteArray, readBack);
        CDocumentSet out;
        out.SetDescription(description.toStdString());
        const std::string bytes = Store(out);
        QCOMPARE(QByteArray::fromStdString(bytes.substr(0, written.size())), written);
        CDocumentSet in;
        Load(in, bytes);
        QCOMPARE(QByteArray::fromStdString(in.GetDescription()), readBack);
    }

    void oneCharacterDescriptionFromOlderWriterIsEmpty()
    {
        // Older writers wrote the length 1 and nothing else.
        CDocumentSet out;
        const std::string tail = Store(out).substr(4);
        CDocumentSet in;
        Load(in, ParseHexFixture("01 00 00 00").toStdString() + tail);
        QVERIFY(in.GetDescription().empty());
    }

    void plainSetNeverClaimsAlbumAttributes()
    {
        CDocumentSet set;
        set.SetAlbumFlag(1); // only an album writes the attributes the flag announces
        CPhotoAlbum in;
        Load(in, Store(set));
        QCOMPARE(in.GetAlbumFlag(), 0);
    }

    void setterAndWriterKeepLinesWhole()
    {
        CEventItem event;
        event.SetEventName("a\r\nb");
        event.SetLocation("c\nd");
        QCOMPARE(event.GetEventName(), std::string("a  b"));
        CEventItem in;
        Load(in, Store(event));
        QCOMPARE(in.GetLocation(), std::string("c d"));
        QCOMPARE(in.GetName(), event.GetName());
    }

    void eventTextLines_data()
    {
        QTest::addColumn<QString>("comments");
        QTest::addColumn<QStringList>("tail");
        QTest::newRow("empty comments give one empty line") << "" << QStringList{""};
        QTest::newRow("trailing pair ends with an empty line")
            << "Cake\r\n" << QStringList{"Cake", ""};
        QTest::newRow("empty stretch") << "a\r\n\r\nb" << QStringList{"a", "", "b"};
        QTest::newRow("lone LF stays in its line") << "a\nb" << QStringList{"a\nb"};
    }

    void eventTextLines()
    {
        QFETCH(QString, comments);
        QFETCH(QStringList, tail);
        CEventItem event;
        event.SetEventName("Party");
        event.SetOccasion("New Year");
        event.SetLocation("Home");
        event.SetStartDate(CTime(1072915200)); // 2004-01-01 00:00 UTC
        event.SetEndDate(CTime(1073001600));   // 2004-01-02
        event.SetComments(comments.toStdString());
        std::vector<std::string> lines;
        event.AppendTextLines(lines);
        QStringList got;
        for (const auto& line : lines)
            got << QString::fromStdString(line);
        const QStringList expected =
            QStringList{"Party was for New Year.",
                        "The event took place between January 01 2004 and January 02 2004 at "
                        "Home."} +
            tail;
        QCOMPARE(got, expected);
        QCOMPARE(QString::fromStdString(event.GetMailText()), expected.join('\n'));
    }

    void setTextIsItsDescription()
    {
        CDocumentSet set;
        set.SetDescription("one\r\ntwo");
        std::vector<std::string> lines;
        set.AppendTextLines(lines);
        QCOMPARE(lines, (std::vector<std::string>{"one", "two"}));
        QCOMPARE(set.GetMailText(), std::string("one\r\ntwo"));
    }
};

QTEST_GUILESS_MAIN(TestItems)
#include "tst_items.moc"
