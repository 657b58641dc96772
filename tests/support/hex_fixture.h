#pragma once
// Hand-written binary fixtures: hex bytes and "quoted" text (with the escapes
// backslash-n, backslash-r, double backslash), comments after //.

#include <QByteArray>
#include <QString>

QByteArray ParseHexFixture(const QByteArray& text);
// Reads HB_TEST_DATA/<relativePath> and parses it; fails the test when missing.
QByteArray LoadHexFixture(const QString& relativePath);
