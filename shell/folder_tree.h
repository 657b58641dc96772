#pragma once
// The logic of the folder tree of the "Documents" tab, the photo view and the
// "Select Folder" dialog: volumes at the top, sub-folders read from disk only
// when a folder is expanded (and again at every expansion), a placeholder
// child wherever a folder has sub-folders not yet read.

#include "shell/volumes.h"

#include <cstdint>
#include <string>
#include <vector>

class CPrompt;

// The tree control the logic fills: a widget in the GUI, a plain tree in
// tests. Each item keeps its full path. Handle 0 is the top level.
class CFolderTreeSink
{
public:
    using Handle = std::uintptr_t;
    virtual ~CFolderTreeSink() = default;
    // Inserts a child of parent: at the end, or in order of text when sorted.
    virtual Handle InsertItem(Handle parent, const std::string& text, const std::string& path,
                              int image, bool sorted) = 0;
    virtual void DeleteItem(Handle item) = 0;
    virtual std::vector<Handle> Children(Handle item) const = 0;
    virtual std::string Path(Handle item) const = 0;
    virtual int Image(Handle item) const = 0;
    virtual void SetImage(Handle item, int image) = 0;
};

class CFolderTree
{
public:
    enum Image
    {
        kImageDrive = 0,
        kImageCdRom = 2,
        kImageFolder = 4,
        kImageOpenFolder = 5,
        kImagePlaceholder = 6
    };
    static constexpr const char* kPlaceholderText = "dummy";

    CFolderTree(CFolderTreeSink& sink, CPrompt& prompt);

    // Adds the volumes as top items; returns how many were added.
    int AddDrives(const std::vector<CVolume>& volumes);
    bool AddDriveItem(const CVolume& volume);
    // Whether the folder holds at least one folder (false when unreadable).
    static bool HasSubfolder(const std::string& path);
    // Adds the folder's sub-folders below item; returns how many.
    int AddSubfolders(CFolderTreeSink::Handle item, const std::string& path);
    std::string GetItemPath(CFolderTreeSink::Handle item) const;
    // Before an item opens (expand) or closes: reads or forgets its folders.
    void OnExpanding(CFolderTreeSink::Handle item, bool expand);

private:
    void AddPlaceholderIfNeeded(CFolderTreeSink::Handle item, const std::string& path);

    CFolderTreeSink& m_sink;
    CPrompt& m_prompt;
};
