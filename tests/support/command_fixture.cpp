#include "tests/support/command_fixture.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

CCommandFixture::CCommandFixture()
    : folders(dir.path().toStdString() + "/home"), doc(prompt, folders), env(doc)
{
    folders.CreateFolderPath(folders.GetDataFolder());
    folders.CreateFolders();
    env.SetClock([] { return CTime(kNow); });
    doc.SetCurrentCategoryPath(kRootDocuments);
}

std::string CCommandFixture::Root() const
{
    return dir.path().toStdString();
}

std::string CCommandFixture::MakeFile(const std::string& relative, const std::string& content)
{
    const std::string path = Root() + "/" + relative;
    QDir().mkpath(QFileInfo(QString::fromStdString(path)).path());
    QFile file(QFile::decodeName(path.c_str()));
    file.open(QIODevice::WriteOnly);
    file.write(content.data(), static_cast<qint64>(content.size()));
    return path;
}

std::string CCommandFixture::MakeFolder(const std::string& relative)
{
    const std::string path = Root() + "/" + relative;
    QDir().mkpath(QString::fromStdString(path));
    return path;
}

void CCommandFixture::ScriptLoad(const std::string& folder, bool unique, bool archive)
{
    prompt.selectFolder.push_back([folder, unique, archive](CSelectFolderFields& fields) {
        fields.selectedFolder = folder;
        fields.uniqueEntries = unique;
        fields.archiveMode = archive;
        return true;
    });
}
