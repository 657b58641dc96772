#pragma once
// The fields of the dialogs the commands run, as the prompt interface hands
// them over: a window fills them in, the command line from its options and
// tests from a script. Each struct starts as the dialog opens.

#include "catalog/ctime.h"
#include "catalog/event_item.h"
#include "catalog/item_list.h"
#include "catalog/recipe_item.h"

#include <memory>
#include <string>
#include <vector>

class CDocumentSet;

// "Select Folder": the folder tree with the load options (full form), or the
// tree alone (compact form).
struct CSelectFolderFields
{
    std::string selectedFolder;
    std::string category; // baseCategory, or baseCategory\newCategory
    std::string baseCategory;
    std::string newCategory;
    std::string keyword1;
    std::string keyword2;
    bool archiveMode = false;
    bool uniqueEntries = false;
    bool createSubCategories = true;
    bool archiveRemovable = true; // archive default for removable, network and CD volumes
    bool archiveFixed = false;    // archive default for fixed volumes and RAM disks
    bool fixedDrive = false;
    bool fullMode = true;
};

// The open-file dialog of the add commands, with a category tree, a caption
// and an "Archive" box.
struct CDocumentFileFields
{
    std::string title = "Document Filename";
    std::string filter = "Document Files (*.*)|*.*||";
    bool multiSelect = true;
    std::string category;                // where the files are filed (shown)
    std::vector<std::string> categories; // category paths for the tree
    std::vector<std::string> files;      // chosen, in the dialog's order
    std::string caption;
    bool archive = false;
    int errorCode = 0; // when the dialog failed: 0x3001, 0x3002 or 0x3003
};

// "Manage Files Dialog": a category under "DOCUMENTS" and two keywords.
struct CManageFilesFields
{
    std::vector<std::string> categories;
    std::string category;
    std::string keyword1;
    std::string keyword2;
};

// The category chooser ("Destination Category").
struct CCategoryChooserFields
{
    std::string caption = "Destination Category";
    std::vector<std::string> roots;
    std::vector<std::string> categories;
    std::string category;
};

// "Update Document Set": copies of the catalog's sets; the chosen set's
// sequence number, 0 for none.
struct CUpdateDocumentSetFields
{
    std::vector<std::shared_ptr<const CDocumentSet>> sets;
    std::vector<std::string> categories;
    int32_t chosenSequence = 0;
};

// "New Category": one name below the selected category.
struct CNewCategoryFields
{
    std::string parentPath;
    std::string name;
};

// "Edit Document" and "Edit Picture Entry": the texts of one catalog entry.
struct CEntryEditFields
{
    std::string label;
    std::string pathname; // changes only through the dialog's "Archive"
    std::string originalPathname;
    std::string category;
    std::string creationDate; // "%b %d, %Y"
    std::string keyword1;
    std::string keyword2;
    CTime searchDate;
    bool managed = true;
    bool archiveEnabled = true;
};

// "Event".
struct CEventFields
{
    std::string eventName;
    bool nameEditable = true; // only a new event's name can be changed
    std::string occasion;
    CTime startDate;
    CTime endDate;
    std::string location;
    std::string keyword1;
    std::string keyword2;
    std::string comments;
    std::vector<CAttendee> attendees;
};

// "Recipe".
struct CRecipeFields
{
    std::string dish;
    std::string author;
    std::vector<CIngredient> ingredients;
    std::string directions;
    std::string keyword1; // "Primary Ingredient"
    std::string keyword2;
    int32_t displayType = 1;
};

// "Document Sets": the set's texts and its members.
struct CDocumentSetFields
{
    std::string label;
    std::string description;
    std::string keyword1;
    std::string keyword2;
    std::vector<std::shared_ptr<CDocumentItem>> members;
};

// "Resize/Convert Picture(s)".
struct CPicResizeFields
{
    enum Mode
    {
        Scale = 1,
        Crop = 2,
        Small = 3,
        VerySmall = 4
    };
    enum CropLocation
    {
        Center = 0,
        RightTop,
        RightBottom,
        LeftBottom,
        LeftTop
    };

    int mode = Scale;
    int width = 0;
    int height = 0;
    bool maintainRatio = true;
    int cropLocation = Center;
    bool convert = false;
    std::string pictureType = "jpg"; // "jpg", "bmp", "png" or "gif"
    int referenceWidth = 0;          // the size the ratio is kept from
    int referenceHeight = 0;
};
