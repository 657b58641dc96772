// Catalog items: constructors and copy rules, item lists, and every record
// written and read back through the stream.

#include "catalog/archive.h"
#include "catalog/catalog_items.h"
#include "catalog/catalog_json.h"
#include "tests/support/hex_fixture.h"

#include <QtTest>

namespace {

// Writes or reads an item's record the way the catalog file does.
void Exchange(CCatalogItem& item, CArchive& ar, int version)
{
    if (auto* document = dynamic_cast<CDocumentItem*>(&item))
        document->SerializeVersioned(ar, version);
    else if (auto* set = dynamic_cast<CDocumentSetBase*>(&item))
        set->SerializeVersioned(ar, version);
    else
        item.Serialize(ar);
}

std::string Store(CCatalogItem& item, int version = 6)
{
    std::string out;
    CArchive ar(&out);
    Exchange(item, ar, version);
    return out;
}

void Load(CCatalogItem& item, const std::string& bytes, int version = 6)
{
    CArchive ar{std::string_view(bytes)};
    Exchange(item, ar, version);
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

// Every stored field of an item (the dump writes them all; a dump imported
// again gives back the same file, byte for byte).
QJsonObject Fields(const CCatalogItem& item)
{
    return CatalogItemToJson(item);
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
        QTest::newRow("with extension") << "/a/letter.doc"
                                        << "letter";
        QTest::newRow("no extension loses four characters") << "/a/readme"
                                                            << "re";
        QTest::newRow("relative") << "readme.txt"
                                  << "readme";
        QTest::newRow("four characters") << "a.tx"
                                         << "";
        QTest::newRow("top folder") << "/x.doc"
                                    << "x";
        QTest::newRow("dot in folder") << "/pics.old/photo.jpeg"
                                       << "photo.";
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

    void newItemDates()
    {
        const CTime before = CTime::GetCurrentTime();
        const CDocumentItem document;
        const CEventItem event;
        QVERIFY(document.GetUpdateDate() >= before); // documents start updated now
        QCOMPARE(event.GetUpdateDate(), CTime());    // the other kinds with zero
        QVERIFY(event.GetCreateDate() >= before);
        QCOMPARE(CDocumentSet().GetCategoryPath(), std::string("DOCUMENT SETS"));
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
        QCOMPARE(Fields(b), Fields(*a));
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
        QCOMPARE(set.GetName(), album.GetName());
        QCOMPARE(set.GetDocumentNumber(), album.GetDocumentNumber());
        QCOMPARE(set.GetAlbumFlag(), 1);
        QCOMPARE(set.GetMembers().at(0).get(), member.get());
        QCOMPARE(member->GetRefCount(), 2);
    }

    void roundTrip_data()
    {
        QTest::addColumn<QString>("kind");
        for (const char* kind : {"document", "picture", "event", "recipe", "album", "set"})
            QTest::newRow(kind) << QString(kind);
    }

    void roundTrip()
    {
        QFETCH(QString, kind);
        std::unique_ptr<CCatalogItem> out;
        std::unique_ptr<CCatalogItem> in;
        if (kind == "document" || kind == "picture") {
            const bool picture = kind == "picture";
            auto d = std::unique_ptr<CDocumentItem>(picture ? new CPictureItem : new CDocumentItem);
            FillDocument(*d, 7);
            out = std::move(d);
            in.reset(picture ? new CPictureItem : new CDocumentItem);
        } else if (kind == "event") {
            auto e = std::make_unique<CEventItem>();
            e->SetEventName("Birthday");
            e->SetLocation("Home");
            e->SetOccasion("Ann turns 40");
            e->SetComments("Cake\r\nGames\r\n");
            e->SetStartDate(CTime(-5));
            e->SetEndDate(CTime(0x3F000000));
            e->GetAttendees().emplace_back("Ann");
            e->GetAttendees().emplace_back("");
            out = std::move(e);
            in = std::make_unique<CEventItem>();
        } else if (kind == "recipe") {
            auto r = std::make_unique<CRecipeItem>();
            r->SetDish("Pancakes");
            r->SetAuthor("Ann");
            r->SetDirections("Mix.\r\nFry.");
            r->GetIngredients().emplace_back("2", "cups", "flour");
            r->GetIngredients().emplace_back("", "", "salt");
            out = std::move(r);
            in = std::make_unique<CRecipeItem>();
        } else {
            std::unique_ptr<CDocumentSet> set;
            if (kind == "album") {
                auto album = std::make_unique<CPhotoAlbum>();
                album->SetBackgroundColor(0x123456);
                album->SetPicturesPerPage(4);
                album->SetColumns(3);
                album->SetDisplayCaption(0);
                album->SetThumbnailSize(0);
                album->SetDisplayType(0);
                album->SetTitle(std::string(300, 'T'));
                set = std::move(album);
            } else {
                set = std::make_unique<CDocumentSet>();
            }
            set->SetLabel("Trip");
            set->SetDescription("Our trip\r\nto the sea");
            for (int i = 0; i < 3; ++i) {
                auto member = std::make_shared<CDocumentItem>();
                FillDocument(*member, 20 + i);
                member->SetSequenceNumber(i + 1); // members are numbered 1, 2, 3 when read
                set->GetMembers().Append(member);
            }
            out = std::move(set);
            // The reader builds every set as an album.
            in = std::make_unique<CPhotoAlbum>();
        }
        if (kind != "document" && kind != "picture")
            FillCommon(*out, 5);
        Load(*in, Store(*out));
        QJsonObject expected = Fields(*out);
        if (kind == "set")
            expected["albumFlag"] = 0; // an album object that read flag 0
        QCOMPARE(Fields(*in), expected);
    }

    void albumTitleOf255CharactersOrMore()
    {
        CPhotoAlbum album;
        album.SetTitle(std::string(300, 'T'));
        const std::string bytes = Store(album);
        QCOMPARE(QByteArray::fromStdString(bytes.substr(bytes.size() - 303, 3)),
                 ParseHexFixture("FF 2C 01"));
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
        QJsonObject expected = Fields(out);
        expected["intC"] = 0;
        expected["intD"] = -1;
        expected["intE"] = -1;
        QCOMPARE(Fields(in), expected);
        QCOMPARE(in.GetIntC(), 0);
        QCOMPARE(in.GetIntD(), -1);
        QCOMPARE(in.GetIntE(), -1);
    }

    void emptyCommentsAndNoIngredientsWriteOnlyTheirInt()
    {
        CEventItem event;
        const std::string e = Store(event);
        // three empty lines, then the comments' length 0 and no bytes
        QCOMPARE(QByteArray::fromStdString(e.substr(0, 7)),
                 ParseHexFixture("0A 0A 0A 00 00 00 00"));
        CRecipeItem recipe;
        const std::string r = Store(recipe);
        // two empty lines, directions length 0, ingredient count 0, then the common record
        QCOMPARE(QByteArray::fromStdString(r.substr(0, 10)),
                 ParseHexFixture("0A 0A 00 00 00 00 00 00 00 00"));
        QCOMPARE(r.substr(10, 1), std::string("\n")); // the common record's name
    }

    void descriptionLengths_data()
    {
        QTest::addColumn<QByteArray>("description");
        QTest::addColumn<QByteArray>("written");
        QTest::addColumn<QByteArray>("readBack");
        QTest::newRow("empty") << QByteArray() << ParseHexFixture("00 00 00 00") << QByteArray();
        QTest::newRow("one character keeps a blank")
            << QByteArray("x") << ParseHexFixture("02 00 00 00 \"x \"") << QByteArray("x ");
        QTest::newRow("two characters")
            << QByteArray("\r\n") << ParseHexFixture("02 00 00 00 0D 0A") << QByteArray("\r\n");
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
        QTest::newRow("trailing pair ends with an empty line") << "Cake\r\n"
                                                               << QStringList{"Cake", ""};
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
