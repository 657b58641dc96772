#pragma once
// The field logic of the "Select Folder" dialog: the category shown, and the
// archive mode that follows the type of the volume a chosen folder lies on.

#include "catalog/dialog_fields.h"
#include "shell/volumes.h"

#include <functional>

class CSelectFolderLogic
{
public:
    using VolumeType = std::function<DriveType(const std::string& path)>;

    CSelectFolderLogic(CSelectFolderFields& fields, VolumeType volumeType);

    // The dialog opens: the category is the base category, sub-categories on.
    void Open();
    // A folder was selected in the tree.
    void OnSelectionChanged(const std::string& path);
    // The "New Category" text changed.
    void OnNewCategoryChanged(const std::string& text);

private:
    CSelectFolderFields& m_fields;
    VolumeType m_volumeType;
};
