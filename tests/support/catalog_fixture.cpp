#include "tests/support/catalog_fixture.h"

#include <QDir>
#include <QFile>
#include <QTest>

CCatalogFixture::CCatalogFixture()
{
    QDir(dir.path()).mkpath(QStringLiteral("User Data"));
}

std::string CCatalogFixture::Home() const
{
    return dir.path().toStdString();
}

std::string CCatalogFixture::DataFile() const
{
    return Home() + "/User Data/HearthbookInfo.hbi";
}

void CCatalogFixture::WriteDataFile(const QByteArray& bytes) const
{
    QFile file(QString::fromStdString(DataFile()));
    if (!file.open(QIODevice::WriteOnly | QIODevice::Truncate) || file.write(bytes) != bytes.size())
        qFatal("cannot write %s", DataFile().c_str());
}

QByteArray CCatalogFixture::ReadDataFile() const
{
    QFile file(QString::fromStdString(DataFile()));
    if (!file.open(QIODevice::ReadOnly))
        return QByteArray();
    return file.readAll();
}

std::unique_ptr<CTallowmereDoc> CCatalogFixture::NewDoc()
{
    return std::make_unique<CTallowmereDoc>(prompt, CAppFolders(Home()));
}

std::unique_ptr<CTallowmereDoc> CCatalogFixture::Open()
{
    auto doc = NewDoc();
    if (!doc->OpenCatalog(false)) {
        const std::string text = prompt.shown.empty() ? "" : prompt.shown.back().text;
        qWarning("cannot open the catalog: %s", text.c_str());
        return nullptr;
    }
    return doc;
}
