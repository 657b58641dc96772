#include "tests/support/expectations.h"

#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>

namespace {

QJsonValue Lookup(const QJsonValue& root, const QString& path)
{
    QJsonValue value = root;
    for (const QString& part : path.split('/')) {
        bool isIndex = false;
        const int index = part.toInt(&isIndex);
        if (isIndex && value.isArray())
            value = index < value.toArray().size() ? value.toArray().at(index) : QJsonValue();
        else if (value.isObject())
            value = value.toObject().value(part);
        else
            return QJsonValue(QJsonValue::Undefined);
    }
    return value;
}

QString Unquote(const QString& text)
{
    QString out;
    for (int i = 1; i + 1 < text.size(); ++i) {
        QChar c = text.at(i);
        if (c == '\\' && i + 2 < text.size()) {
            const QChar e = text.at(++i);
            c = e == 'n' ? QChar('\n') : e == 'r' ? QChar('\r') : e;
        }
        out += c;
    }
    return out;
}

QString Shown(const QJsonValue& value)
{
    if (value.isUndefined())
        return "absent";
    if (value.isArray())
        return QString("[%1]").arg(value.toArray().size());
    if (value.isString())
        return '"' + value.toString() + '"';
    return QString::fromUtf8(QJsonDocument(QJsonArray{value}).toJson(QJsonDocument::Compact));
}

} // namespace

QStringList CheckExpectations(const QJsonObject& object, const QString& file, qint64 start)
{
    QFile in(file);
    if (!in.open(QIODevice::ReadOnly))
        return {"cannot read " + file};
    QStringList failures;
    const QJsonValue root(object);
    for (QString line : QString::fromUtf8(in.readAll()).split('\n')) {
        // A comment starts at "//" outside quotes.
        bool quoted = false;
        for (int i = 0; i + 1 < line.size(); ++i) {
            if (line.at(i) == '"' && (i == 0 || line.at(i - 1) != '\\'))
                quoted = !quoted;
            if (!quoted && line.at(i) == '/' && line.at(i + 1) == '/') {
                line.truncate(i);
                break;
            }
        }
        line = line.trimmed();
        if (line.isEmpty())
            continue;
        const int equals = line.indexOf(" = ");
        const QString path = line.left(equals).trimmed();
        const QString want = line.mid(equals + 3).trimmed();
        const QJsonValue got = Lookup(root, path);
        bool ok;
        if (want == "absent") {
            ok = got.isUndefined();
        } else if (want == "now") {
            ok = got.isDouble() && got.toInteger() >= start;
        } else if (want.startsWith('[')) {
            ok = got.isArray() && got.toArray().size() == want.mid(1, want.size() - 2).toInt();
        } else if (want.startsWith('"')) {
            ok = got.isString() && got.toString() == Unquote(want);
        } else {
            bool number = false;
            const qint64 value = want.toLongLong(&number, 0);
            ok = number && got.isDouble() && got.toInteger() == value;
        }
        if (!ok)
            failures << QString("%1: expected %2, got %3").arg(path, want, Shown(got));
    }
    return failures;
}
