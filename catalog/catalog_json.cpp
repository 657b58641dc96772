#include "catalog/catalog_json.h"

#include "catalog/tallowmere_doc.h"
#include "catalog/text_util.h"

#include <QJsonArray>

#include <cmath>
#include <stdexcept>

namespace {

QString Text(const std::string& bytes)
{
    return QString::fromStdString(DisplayUtf8(bytes));
}

QJsonObject ItemObject(const CCatalogItem& item)
{
    QJsonObject o;
    o["name"] = Text(item.GetName());
    o["kindTag"] = Text(item.GetKindTag());
    o["categoryPath"] = Text(item.GetCategoryPath());
    o["keyword1"] = Text(item.GetKeyword1());
    o["keyword2"] = Text(item.GetKeyword2());
    o["flagA"] = item.GetFlagA();
    o["flagB"] = item.GetFlagB();
    o["createDate"] = static_cast<qint64>(item.GetCreateDate().GetTime());
    o["updateDate"] = static_cast<qint64>(item.GetUpdateDate().GetTime());
    o["documentNumber"] = static_cast<qint64>(item.GetDocumentNumber());
    o["sequenceNumber"] = item.GetSequenceNumber();
    return o;
}

QJsonObject DocumentObject(const CDocumentItem& d)
{
    QJsonObject o = ItemObject(d);
    o["pathname"] = Text(d.GetPathname());
    o["originalPathname"] = Text(d.GetOriginalPathname());
    o["label"] = Text(d.GetLabel());
    o["documentCategoryPath"] = Text(d.GetDocumentCategoryPath());
    o["fileCreateDate"] = static_cast<qint64>(d.GetFileCreateDate().GetTime());
    o["fileModifyDate"] = static_cast<qint64>(d.GetFileModifyDate().GetTime());
    o["fileSize"] = static_cast<qint64>(d.GetFileSize());
    o["intC"] = d.GetIntC();
    o["intD"] = d.GetIntD();
    o["intE"] = d.GetIntE();
    return o;
}

QJsonArray DocumentArray(const CItemList& list)
{
    QJsonArray a;
    for (const auto& item : list)
        a.append(DocumentObject(*item));
    return a;
}

// Reads typed fields of one JSON object; a wrong type or a line break in a
// single-line field throws with the field's full name.
class FieldReader
{
public:
    FieldReader(const QJsonObject& object, std::string where)
        : m_object(object), m_where(std::move(where))
    {}

    std::string Name(const char* key) const { return m_where + "." + key; }

    void Line(const char* key, std::string& out) const { Str(key, out, false); }
    void MultiLine(const char* key, std::string& out) const { Str(key, out, true); }

    void Str(const char* key, std::string& out, bool multiLine) const
    {
        const QJsonValue v = m_object.value(QLatin1String(key));
        if (v.isUndefined())
            return;
        if (!v.isString())
            throw std::runtime_error(Name(key) + " must be a string");
        std::string text = v.toString().toStdString();
        if (!multiLine && HasLineBreak(text))
            throw std::runtime_error(Name(key) +
                                     " holds a line break, which a line field cannot store");
        out = std::move(text);
    }

    int64_t Integer(const char* key, int64_t fallback, int64_t low, int64_t high) const
    {
        const QJsonValue v = m_object.value(QLatin1String(key));
        if (v.isUndefined())
            return fallback;
        const double d = v.toDouble(std::nan(""));
        if (!v.isDouble() || std::isnan(d) || d != std::floor(d) || d < static_cast<double>(low) ||
            d > static_cast<double>(high))
            throw std::runtime_error(Name(key) + " must be a whole number from " +
                                     std::to_string(low) + " to " + std::to_string(high));
        return static_cast<int64_t>(d);
    }

    int32_t Int(const char* key, int32_t fallback) const
    {
        return static_cast<int32_t>(Integer(key, fallback, INT32_MIN, INT32_MAX));
    }

    uint32_t Color(const char* key, uint32_t fallback) const
    {
        const int64_t v = Integer(key, fallback, INT32_MIN, UINT32_MAX);
        return static_cast<uint32_t>(v);
    }

    CTime Time(const char* key, CTime fallback) const
    {
        return CTime(Integer(key, fallback.GetTime(), -(int64_t(1) << 53), int64_t(1) << 53));
    }

    QJsonArray Array(const char* key) const
    {
        const QJsonValue v = m_object.value(QLatin1String(key));
        if (v.isUndefined())
            return QJsonArray();
        if (!v.isArray())
            throw std::runtime_error(Name(key) + " must be an array");
        return v.toArray();
    }

    FieldReader Object(const QJsonArray& array, int index, const char* key) const
    {
        const std::string name = Name(key) + "[" + std::to_string(index) + "]";
        if (!array.at(index).isObject())
            throw std::runtime_error(name + " must be an object");
        return FieldReader(array.at(index).toObject(), name);
    }

private:
    QJsonObject m_object;
    std::string m_where;
};

void ReadItem(const FieldReader& r, CCatalogItem& item)
{
    std::string s = item.GetName();
    r.Line("name", s);
    item.SetName(s);
    s = item.GetKindTag();
    r.Line("kindTag", s);
    item.SetKindTag(s);
    s = item.GetCategoryPath();
    r.Line("categoryPath", s);
    item.SetCategoryPath(s);
    s = item.GetKeyword1();
    r.Line("keyword1", s);
    item.SetKeyword1(s);
    s = item.GetKeyword2();
    r.Line("keyword2", s);
    item.SetKeyword2(s);
    item.SetFlagA(r.Int("flagA", item.GetFlagA()));
    item.SetFlagB(r.Int("flagB", item.GetFlagB()));
    item.SetCreateDate(r.Time("createDate", item.GetCreateDate()));
    item.SetUpdateDate(r.Time("updateDate", item.GetUpdateDate()));
    item.SetDocumentNumber(
        r.Integer("documentNumber", item.GetDocumentNumber(), INT64_MIN, INT64_MAX));
}

void ReadDocument(const FieldReader& r, CDocumentItem& d)
{
    ReadItem(r, d);
    std::string s;
    r.Line("pathname", s);
    d.SetPathname(s);
    s.clear();
    r.Line("originalPathname", s);
    d.SetOriginalPathname(s);
    s.clear();
    r.Line("label", s);
    d.SetLabel(s);
    s.clear();
    r.Line("documentCategoryPath", s);
    d.SetDocumentCategoryPath(s);
    d.SetFileCreateDate(r.Time("fileCreateDate", d.GetFileCreateDate()));
    d.SetFileModifyDate(r.Time("fileModifyDate", d.GetFileModifyDate()));
    d.SetFileSize(static_cast<uint64_t>(r.Integer("fileSize", 0, 0, int64_t(1) << 53)));
    d.SetIntC(r.Int("intC", d.GetIntC()));
    d.SetIntD(r.Int("intD", d.GetIntD()));
    d.SetIntE(r.Int("intE", d.GetIntE()));
}

void ReadDocuments(const FieldReader& r, const char* key, CItemList& list, bool pictures)
{
    const QJsonArray array = r.Array(key);
    for (int i = 0; i < array.size(); ++i) {
        std::shared_ptr<CDocumentItem> item;
        if (pictures)
            item = std::make_shared<CPictureItem>();
        else
            item = std::make_shared<CDocumentItem>();
        ReadDocument(r.Object(array, i, key), *item);
        list.Append(std::move(item));
    }
}

} // namespace

QJsonObject CatalogItemToJson(const CCatalogItem& item)
{
    if (const auto* d = dynamic_cast<const CDocumentItem*>(&item))
        return DocumentObject(*d);
    QJsonObject o = ItemObject(item);
    if (const auto* r = dynamic_cast<const CRecipeItem*>(&item)) {
        o["dish"] = Text(r->GetDish());
        o["author"] = Text(r->GetAuthor());
        o["directions"] = Text(r->GetDirections());
        QJsonArray ingredients;
        for (const CIngredient& i : r->GetIngredients()) {
            QJsonObject io;
            io["amount"] = Text(i.GetAmount());
            io["measurement"] = Text(i.GetMeasurement());
            io["ingredient"] = Text(i.GetIngredient());
            ingredients.append(io);
        }
        o["ingredients"] = ingredients;
    } else if (const auto* s = dynamic_cast<const CDocumentSet*>(&item)) {
        o["albumFlag"] = s->GetAlbumFlag();
        o["description"] = Text(s->GetDescription());
        o["label"] = Text(s->GetLabel());
        o["members"] = DocumentArray(s->GetMembers());
        if (s->GetAlbumFlag() != 0 && s->IsAlbum()) {
            const auto& a = static_cast<const CPhotoAlbum&>(*s);
            o["backgroundColor"] = static_cast<qint64>(a.GetBackgroundColor());
            o["picturesPerPage"] = a.GetPicturesPerPage();
            o["columns"] = a.GetColumns();
            o["displayCaption"] = a.GetDisplayCaption();
            o["thumbnailSize"] = a.GetThumbnailSize();
            o["displayType"] = a.GetDisplayType();
            o["title"] = Text(a.GetTitle());
        }
    } else if (const auto* e = dynamic_cast<const CEventItem*>(&item)) {
        o["eventName"] = Text(e->GetEventName());
        o["location"] = Text(e->GetLocation());
        o["occasion"] = Text(e->GetOccasion());
        o["comments"] = Text(e->GetComments());
        o["startDate"] = static_cast<qint64>(e->GetStartDate().GetTime());
        o["endDate"] = static_cast<qint64>(e->GetEndDate().GetTime());
        QJsonArray attendees;
        for (const CAttendee& a : e->GetAttendees())
            attendees.append(Text(a.GetName()));
        o["attendees"] = attendees;
    }
    return o;
}

QJsonObject DumpCatalog(const CTallowmereDoc& doc)
{
    QJsonObject root;
    root["formatVersion"] = doc.GetFormatVersion();
    root["creationDate"] = static_cast<qint64>(doc.GetCreationDate().GetTime());
    root["reservedDate"] = static_cast<qint64>(doc.GetReservedDate().GetTime());
    root["documentNumberCounter"] = static_cast<qint64>(doc.GetDocumentNumberCounter());
    root["pictures"] = DocumentArray(doc.GetPictures());
    root["documents"] = DocumentArray(doc.GetDocuments());

    QJsonArray categories;
    for (const auto& c : doc.GetCategories()) {
        QJsonObject o;
        o["name"] = Text(c->GetName());
        o["parentPath"] = Text(c->GetParentPath());
        o["depth"] = c->GetDepth();
        categories.append(o);
    }
    root["categories"] = categories;

    QJsonArray recipes;
    for (const auto& r : doc.GetRecipes())
        recipes.append(CatalogItemToJson(*r));
    root["recipes"] = recipes;
    QJsonArray sets;
    for (const auto& set : doc.GetDocumentSets())
        sets.append(CatalogItemToJson(*set));
    root["documentSets"] = sets;
    QJsonArray events;
    for (const auto& e : doc.GetEvents())
        events.append(CatalogItemToJson(*e));
    root["events"] = events;

    const CCatalogSettings& st = doc.GetSettings();
    QJsonObject settings;
    settings["albumBackgroundColor"] = static_cast<qint64>(st.albumBackgroundColor);
    settings["albumPicturesPerPage"] = st.albumPicturesPerPage;
    settings["albumDisplayCaption"] = st.albumDisplayCaption;
    settings["albumThumbnailSize"] = st.albumThumbnailSize;
    settings["albumThumbnailColumns"] = st.albumThumbnailColumns;
    settings["archiveOnFixedDisks"] = st.archiveOnFixedDisks;
    settings["archiveOnRemovableMedia"] = st.archiveOnRemovableMedia;
    settings["compareFileCreateDate"] = st.compareFileCreateDate;
    settings["compareFileModifyDate"] = st.compareFileModifyDate;
    settings["compareFileName"] = st.compareFileName;
    settings["compareFileSize"] = st.compareFileSize;
    settings["uniqueEntryCheckDefault"] = st.uniqueEntryCheckDefault;
    settings["previewWindow"] = st.previewWindow;
    settings["accentColor"] = static_cast<qint64>(st.accentColor);
    settings["backgroundColor"] = static_cast<qint64>(st.backgroundColor);
    settings["colorScheme"] = st.colorScheme;
    root["settings"] = settings;
    return root;
}

bool ImportCatalog(const QJsonObject& object, CTallowmereDoc& doc, std::string& error)
{
    doc.RemoveAll();
    try {
        const FieldReader r(object, "catalog");
        doc.SetCreationDate(r.Time("creationDate", CTime()));
        doc.SetReservedDate(r.Time("reservedDate", CTime()));
        doc.SetDocumentNumberCounter(r.Integer("documentNumberCounter", 0, INT64_MIN, INT64_MAX));
        ReadDocuments(r, "pictures", doc.GetPictures(), true);
        ReadDocuments(r, "documents", doc.GetDocuments(), false);

        const QJsonArray categories = r.Array("categories");
        for (int i = 0; i < categories.size(); ++i) {
            const FieldReader c = r.Object(categories, i, "categories");
            std::string name;
            std::string parent;
            c.Line("name", name);
            c.Line("parentPath", parent);
            doc.GetCategories().Append(
                std::make_unique<CCategory>(name, parent, c.Int("depth", 0)));
        }

        const QJsonArray recipes = r.Array("recipes");
        for (int i = 0; i < recipes.size(); ++i) {
            const FieldReader o = r.Object(recipes, i, "recipes");
            auto recipe = std::make_unique<CRecipeItem>();
            ReadItem(o, *recipe);
            std::string s;
            o.Line("dish", s);
            recipe->SetDish(s);
            s.clear();
            o.Line("author", s);
            recipe->SetAuthor(s);
            s.clear();
            o.MultiLine("directions", s);
            recipe->SetDirections(s);
            const QJsonArray ingredients = o.Array("ingredients");
            for (int k = 0; k < ingredients.size(); ++k) {
                const FieldReader g = o.Object(ingredients, k, "ingredients");
                std::string amount;
                std::string measurement;
                std::string ingredient;
                g.Line("amount", amount);
                g.Line("measurement", measurement);
                g.Line("ingredient", ingredient);
                recipe->GetIngredients().emplace_back(amount, measurement, ingredient);
            }
            doc.AddRecipe(std::move(recipe));
        }

        const QJsonArray sets = r.Array("documentSets");
        for (int i = 0; i < sets.size(); ++i) {
            const FieldReader o = r.Object(sets, i, "documentSets");
            const int32_t albumFlag = o.Int("albumFlag", 0);
            std::unique_ptr<CDocumentSet> set;
            if (albumFlag != 0) {
                auto album = std::make_unique<CPhotoAlbum>();
                album->SetBackgroundColor(o.Color("backgroundColor", album->GetBackgroundColor()));
                album->SetPicturesPerPage(o.Int("picturesPerPage", album->GetPicturesPerPage()));
                album->SetColumns(o.Int("columns", album->GetColumns()));
                album->SetDisplayCaption(o.Int("displayCaption", album->GetDisplayCaption()));
                album->SetThumbnailSize(o.Int("thumbnailSize", album->GetThumbnailSize()));
                album->SetDisplayType(o.Int("displayType", album->GetDisplayType()));
                std::string title;
                o.MultiLine("title", title);
                album->SetTitle(title);
                set = std::move(album);
            } else {
                set = std::make_unique<CDocumentSet>();
            }
            ReadItem(o, *set);
            set->SetAlbumFlag(albumFlag);
            std::string s;
            o.MultiLine("description", s);
            set->SetDescription(s);
            s.clear();
            o.Line("label", s);
            set->SetLabel(s);
            ReadDocuments(o, "members", set->GetMembers(), false);
            doc.AddDocumentSet(std::move(set));
        }

        const QJsonArray events = r.Array("events");
        for (int i = 0; i < events.size(); ++i) {
            const FieldReader o = r.Object(events, i, "events");
            auto event = std::make_unique<CEventItem>();
            ReadItem(o, *event);
            std::string s;
            o.Line("eventName", s);
            event->SetEventName(s);
            s.clear();
            o.Line("location", s);
            event->SetLocation(s);
            s.clear();
            o.Line("occasion", s);
            event->SetOccasion(s);
            s.clear();
            o.MultiLine("comments", s);
            event->SetComments(s);
            event->SetStartDate(o.Time("startDate", CTime()));
            event->SetEndDate(o.Time("endDate", CTime()));
            const QJsonArray attendees = o.Array("attendees");
            for (int k = 0; k < attendees.size(); ++k) {
                const std::string name = o.Name("attendees") + "[" + std::to_string(k) + "]";
                if (!attendees.at(k).isString())
                    throw std::runtime_error(name + " must be a string");
                const std::string text = attendees.at(k).toString().toStdString();
                if (HasLineBreak(text))
                    throw std::runtime_error(
                        name + " holds a line break, which a line field cannot store");
                event->GetAttendees().emplace_back(text);
            }
            doc.AddEvent(std::move(event));
        }

        CCatalogSettings st;
        const QJsonValue sv = object.value(QLatin1String("settings"));
        if (!sv.isUndefined() && !sv.isObject())
            throw std::runtime_error("catalog.settings must be an object");
        const FieldReader s(sv.toObject(), "catalog.settings");
        st.albumBackgroundColor = s.Color("albumBackgroundColor", st.albumBackgroundColor);
        st.albumPicturesPerPage = s.Int("albumPicturesPerPage", st.albumPicturesPerPage);
        st.albumDisplayCaption = s.Int("albumDisplayCaption", st.albumDisplayCaption);
        st.albumThumbnailSize = s.Int("albumThumbnailSize", st.albumThumbnailSize);
        st.albumThumbnailColumns = s.Int("albumThumbnailColumns", st.albumThumbnailColumns);
        st.archiveOnFixedDisks = s.Int("archiveOnFixedDisks", st.archiveOnFixedDisks);
        st.archiveOnRemovableMedia = s.Int("archiveOnRemovableMedia", st.archiveOnRemovableMedia);
        st.compareFileCreateDate = s.Int("compareFileCreateDate", st.compareFileCreateDate);
        st.compareFileModifyDate = s.Int("compareFileModifyDate", st.compareFileModifyDate);
        st.compareFileName = s.Int("compareFileName", st.compareFileName);
        st.compareFileSize = s.Int("compareFileSize", st.compareFileSize);
        st.uniqueEntryCheckDefault = s.Int("uniqueEntryCheckDefault", st.uniqueEntryCheckDefault);
        st.previewWindow = s.Int("previewWindow", st.previewWindow);
        st.accentColor = s.Color("accentColor", st.accentColor);
        st.backgroundColor = s.Color("backgroundColor", st.backgroundColor);
        st.colorScheme = s.Int("colorScheme", st.colorScheme);
        doc.GetSettings() = st;
    } catch (const std::runtime_error& e) {
        doc.RemoveAll();
        error = e.what();
        return false;
    }
    return true;
}
