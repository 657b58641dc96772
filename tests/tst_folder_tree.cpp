// The folder tree logic on a plain in-memory tree, volume types, and the
// archive-mode rule of "Select Folder".

#include "shell/folder_tree.h"
#include "shell/select_folder.h"
#include "tests/support/scripted_prompt.h"

#include <QDir>
#include <QTemporaryDir>
#include <QtTest>

#include <algorithm>
#include <map>
#include <unistd.h>

namespace {

class MemoryTree : public CFolderTreeSink
{
public:
    struct Item
    {
        Handle parent;
        std::string text;
        std::string path;
        int image;
        std::vector<Handle> children;
    };

    Handle InsertItem(Handle parent, const std::string& text, const std::string& path, int image,
                      bool sorted) override
    {
        const Handle handle = ++m_next;
        m_items[handle] = {parent, text, path, image, {}};
        std::vector<Handle>& siblings = parent ? m_items[parent].children : m_top;
        auto at = siblings.end();
        if (sorted)
            at = std::find_if(siblings.begin(), siblings.end(),
                              [&](Handle h) { return m_items[h].text > text; });
        siblings.insert(at, handle);
        return handle;
    }
    void DeleteItem(Handle item) override
    {
        for (const Handle child : Children(item))
            DeleteItem(child);
        std::vector<Handle>& siblings =
            m_items[item].parent ? m_items[m_items[item].parent].children : m_top;
        siblings.erase(std::find(siblings.begin(), siblings.end(), item));
        m_items.erase(item);
    }
    std::vector<Handle> Children(Handle item) const override
    {
        return item ? m_items.at(item).children : m_top;
    }
    std::string Path(Handle item) const override { return m_items.at(item).path; }
    int Image(Handle item) const override { return m_items.at(item).image; }
    void SetImage(Handle item, int image) override { m_items.at(item).image = image; }

    const Item& at(Handle item) const { return m_items.at(item); }
    std::vector<std::string> Texts(Handle item) const
    {
        std::vector<std::string> texts;
        for (const Handle child : Children(item))
            texts.push_back(m_items.at(child).text);
        return texts;
    }

private:
    std::map<Handle, Item> m_items;
    std::vector<Handle> m_top;
    Handle m_next = 0;
};

CVolume Volume(const std::string& root, DriveType type, const std::string& label = {})
{
    CVolume volume;
    volume.rootPath = root;
    volume.type = type;
    volume.label = label;
    return volume;
}

} // namespace

class TestFolderTree : public QObject
{
    Q_OBJECT

private slots:
    void classify_data();
    void classify();
    void volumes();
    void driveItems();
    void expandAndCollapse();
    void selectFolderArchiveMode_data();
    void selectFolderArchiveMode();
    void newCategoryText();
};

void TestFolderTree::classify_data()
{
    QTest::addColumn<QString>("fileSystem");
    QTest::addColumn<QString>("mountPoint");
    QTest::addColumn<bool>("removableDevice");
    QTest::addColumn<DriveType>("type");
    const auto row = [](const char* name, const char* fs, const char* mount, bool removable,
                        DriveType type) {
        QTest::newRow(name) << fs << mount << removable << type;
    };
    row("disk", "ext4", "/", false, DriveType::Fixed);
    row("usb stick flag", "vfat", "/mnt/stick", true, DriveType::Removable);
    row("under /media", "vfat", "/media/ann/CAMERA", false, DriveType::Removable);
    row("under /run/media", "exfat", "/run/media/ann/X", false, DriveType::Removable);
    row("not /mediaserver", "ext4", "/mediaserver", false, DriveType::Fixed);
    row("dvd", "iso9660", "/media/cdrom", true, DriveType::CdRom);
    row("blu-ray", "udf", "/media/bd", false, DriveType::CdRom);
    row("nfs", "nfs4", "/net/home", false, DriveType::Remote);
    row("samba", "cifs", "/mnt/share", false, DriveType::Remote);
    row("sshfs", "fuse.sshfs", "/home/ann/remote", false, DriveType::Remote);
    row("tmpfs", "tmpfs", "/tmp", false, DriveType::RamDisk);
}

void TestFolderTree::classify()
{
    QFETCH(QString, fileSystem);
    QFETCH(QString, mountPoint);
    QFETCH(bool, removableDevice);
    QFETCH(DriveType, type);
    QCOMPARE(ClassifyVolume(fileSystem.toStdString(), mountPoint.toStdString(), removableDevice),
             type);
}

void TestFolderTree::volumes()
{
    const std::vector<CVolume> mounted = {Volume("/", DriveType::Fixed),
                                          Volume("/run/user/0", DriveType::RamDisk),
                                          Volume("/media/ann/CAM", DriveType::Removable, "CAM"),
                                          Volume("/media/ann/CAM/DCIM", DriveType::Remote)};
    QCOMPARE(VolumeTypeOf("/media/ann/CAM/x", mounted), DriveType::Removable);
    QCOMPARE(VolumeTypeOf("/media/ann/CAM/DCIM/1", mounted), DriveType::Remote);
    QCOMPARE(VolumeTypeOf("/media/ann/CAMERA", mounted), DriveType::Fixed);
    QCOMPARE(VolumeTypeOf("relative", {}), DriveType::Fixed);
    // The tree's top: the root, the home folder, then the volumes but RAM disks.
    const std::vector<CVolume> top = TreeVolumes(mounted, "/home/ann");
    QCOMPARE(top.size(), size_t(4));
    QCOMPARE(top[0].ItemText(), std::string("/"));
    QCOMPARE(top[1].ItemText(), std::string("/home/ann"));
    QCOMPARE(top[2].ItemText(), std::string("CAM /media/ann/CAM"));
    QCOMPARE(top[2].type, DriveType::Removable);
}

void TestFolderTree::driveItems()
{
    QTemporaryDir dir;
    const std::string files = dir.path().toStdString() + "/files";
    const std::string folders = dir.path().toStdString() + "/folders";
    QDir().mkpath(QString::fromStdString(files));
    QDir().mkpath(QString::fromStdString(folders + "/x"));
    QFile(QString::fromStdString(files + "/a.txt")).open(QIODevice::WriteOnly);
    MemoryTree tree;
    CScriptedPrompt prompt;
    CFolderTree logic(tree, prompt);
    const int added = logic.AddDrives({Volume(files, DriveType::Fixed),
                                       Volume(folders, DriveType::CdRom, "PHOTOS"),
                                       Volume("/nowhere", DriveType::Unknown)});
    QCOMPARE(added, 2);
    const auto top = tree.Children(0);
    QCOMPARE(tree.at(top[0]).image, int(CFolderTree::kImageDrive));
    QVERIFY(tree.Children(top[0]).empty()); // only files: no expand button
    QCOMPARE(tree.at(top[1]).text, "PHOTOS " + folders);
    QCOMPARE(tree.at(top[1]).image, int(CFolderTree::kImageCdRom));
    QCOMPARE(tree.Texts(top[1]), std::vector<std::string>{"dummy"});
    QCOMPARE(prompt.Only().text, std::string("Unknown drive item of type 0"));
    QCOMPARE(prompt.Only().caption, std::string("Add drive item"));
    QVERIFY(!CFolderTree::HasSubfolder(files));
    QVERIFY(!CFolderTree::HasSubfolder(dir.path().toStdString() + "/missing"));
}

void TestFolderTree::expandAndCollapse()
{
    QTemporaryDir dir;
    const std::string root = dir.path().toStdString();
    for (const char* folder : {"b/inner", "a", "c"})
        QDir().mkpath(QString::fromStdString(root + "/" + folder));
    QVERIFY(::symlink((root + "/b").c_str(), (root + "/link").c_str()) == 0);
    MemoryTree tree;
    CScriptedPrompt prompt;
    CFolderTree logic(tree, prompt);
    logic.AddDriveItem(Volume(root + "/", DriveType::Fixed));
    const auto drive = tree.Children(0).at(0);
    logic.OnExpanding(drive, true);
    QCOMPARE(tree.Texts(drive), (std::vector<std::string>{"a", "b", "c", "link"}));
    const auto b = tree.Children(drive).at(1);
    QCOMPARE(logic.GetItemPath(b), root + "/b"); // no doubled '/'
    QCOMPARE(tree.Texts(b), std::vector<std::string>{"dummy"});
    QVERIFY(tree.Texts(tree.Children(drive).at(0)).empty());
    logic.OnExpanding(b, true);
    QCOMPARE(tree.at(b).image, int(CFolderTree::kImageOpenFolder));
    const auto inner = tree.Children(b).at(0);
    QCOMPARE(logic.GetItemPath(inner), root + "/b/inner");

    logic.OnExpanding(b, false);
    QCOMPARE(tree.at(b).image, int(CFolderTree::kImageFolder));
    QCOMPARE(tree.Texts(b), std::vector<std::string>{"dummy"});
    QDir().mkpath(QString::fromStdString(root + "/b/new"));
    logic.OnExpanding(b, true); // read again: the new folder shows
    QCOMPARE(tree.Texts(b), (std::vector<std::string>{"inner", "new"}));
}

void TestFolderTree::selectFolderArchiveMode_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<bool>("archive");
    QTest::addColumn<bool>("fixed");
    QTest::newRow("hard disk takes the fixed default") << "/home/ann/Docs" << false << true;
    QTest::newRow("stick takes the removable default") << "/media/ann/CAM/DCIM" << true << false;
    QTest::newRow("network takes the removable default") << "/net/share/x" << true << false;
    QTest::newRow("RAM disk counts as fixed") << "/tmp/x" << false << true;
}

void TestFolderTree::selectFolderArchiveMode()
{
    QFETCH(QString, path);
    QFETCH(bool, archive);
    QFETCH(bool, fixed);
    const std::vector<CVolume> mounted = {
        Volume("/", DriveType::Fixed), Volume("/media/ann/CAM", DriveType::Removable),
        Volume("/net/share", DriveType::Remote), Volume("/tmp", DriveType::RamDisk)};
    CSelectFolderFields fields;
    fields.archiveFixed = false;
    fields.archiveRemovable = true;
    fields.archiveMode = !archive;
    CSelectFolderLogic logic(fields,
                             [&mounted](const std::string& p) { return VolumeTypeOf(p, mounted); });
    logic.OnSelectionChanged(path.toStdString());
    QCOMPARE(fields.selectedFolder, path.toStdString());
    QCOMPARE(fields.archiveMode, archive);
    QCOMPARE(fields.fixedDrive, fixed);
}

void TestFolderTree::newCategoryText()
{
    CSelectFolderFields fields;
    fields.baseCategory = "DOCUMENTS\\Letters";
    fields.createSubCategories = false;
    CSelectFolderLogic logic(fields, nullptr);
    logic.Open();
    QCOMPARE(fields.category, std::string("DOCUMENTS\\Letters"));
    QVERIFY(fields.createSubCategories);
    logic.OnNewCategoryChanged("2003");
    QCOMPARE(fields.category, std::string("DOCUMENTS\\Letters\\2003"));
    logic.OnNewCategoryChanged("");
    QCOMPARE(fields.category, std::string("DOCUMENTS\\Letters"));
}

QTEST_GUILESS_MAIN(TestFolderTree)
#include "tst_folder_tree.moc"
