#include "tests/support/hex_fixture.h"

#include <QFile>
#include <QTest>

QByteArray ParseHexFixture(const QByteArray& text)
{
    QByteArray out;
    int i = 0;
    const int n = text.size();
    auto hexValue = [](char c) {
        if (c >= '0' && c <= '9')
            return c - '0';
        if (c >= 'a' && c <= 'f')
            return c - 'a' + 10;
        if (c >= 'A' && c <= 'F')
            return c - 'A' + 10;
        return -1;
    };
    while (i < n) {
        const char c = text.at(i);
        if (c == '/' && i + 1 < n && text.at(i + 1) == '/') {
            while (i < n && text.at(i) != '\n')
                ++i;
        } else if (c == '"') {
            ++i;
            while (i < n && text.at(i) != '"') {
                char ch = text.at(i++);
                if (ch == '\\' && i < n) {
                    const char e = text.at(i++);
                    ch = e == 'n' ? '\n' : e == 'r' ? '\r' : e == '0' ? '\0' : e;
                }
                out.append(ch);
            }
            ++i;
        } else if (hexValue(c) >= 0 && i + 1 < n && hexValue(text.at(i + 1)) >= 0) {
            out.append(static_cast<char>(hexValue(c) * 16 + hexValue(text.at(i + 1))));
            i += 2;
        } else if (c == ' ' || c == '\n' || c == '\t' || c == '\r') {
            ++i;
        } else {
            qFatal("bad fixture character '%c' at %d", c, i);
        }
    }
    return out;
}

QByteArray LoadHexFixture(const QString& relativePath)
{
    QFile file(QStringLiteral(HB_TEST_DATA "/") + relativePath);
    if (!file.open(QIODevice::ReadOnly))
        qFatal("missing fixture %s", qPrintable(file.fileName()));
    return ParseHexFixture(file.readAll());
}
