#pragma once
// Hand-written expected values for a JSON object, one per line:
//   path/into/the/object = value      // comment
// value: an integer (decimal or 0x hex), a "quoted" text (\r \n \\ \"), `now`
// (a time from start on), `absent`, or [n] for an array of n entries.

#include <QJsonObject>
#include <QStringList>

// Every expectation the object does not meet, as "path: expected ..., got ...".
QStringList CheckExpectations(const QJsonObject& object, const QString& file, qint64 start);
