#pragma once
// The whole catalog as one JSON object (the command line's dump and
// import-json): every stored field, strings as UTF-8, dates as seconds.

#include <QJsonObject>

#include <string>

class CCatalogItem;
class CTallowmereDoc;

QJsonObject DumpCatalog(const CTallowmereDoc& doc);
// One item with every field it stores (and its sequence number).
QJsonObject CatalogItemToJson(const CCatalogItem& item);

// Replaces the catalog's contents with the object's. Every stored field comes
// from the JSON (a missing key keeps its default); nothing is registered
// anew. False with error naming the field when the input cannot be stored.
bool ImportCatalog(const QJsonObject& object, CTallowmereDoc& doc, std::string& error);
