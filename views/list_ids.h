#pragma once
// The list view's tab kinds and the command numbers it receives (from the
// main frame, its own filter controls and the folder tree).

enum class TabKind : int
{
    Documents = 0,        // files of a folder, not yet in the catalog
    ManagedDocuments = 1, // the catalog's documents and pictures
    DocumentSets = 2,
    Events = 3,
    Recipes = 4,
    PersonalInformation = 5, // no tab; every command is ignored
};

enum ListCommand : int
{
    kCmdLoad = 1323,
    kCmdApplyFilter = 1340,
    kCmdAdd = 1344,
    kCmdDelete = 1345,
    kCmdEdit = 1346,
    kCmdMail = 1347,
    kCmdSave = 1348,
    kCmdPrint = 1352,
    kCmdMove = 1353,
    kCmdCreateSet = 1355,
    kCmdAddToSet = 1356,
    kCmdShowFolder = 1358,
    kCmdSelectAll = 1360,
    kCmdUnselectAll = 1361,
    kCmdSearchFilter = 1362,
    kCmdNewCategory = 1365,
    kCmdRemoveCategory = 1366,
    kCmdWebPages = 1368,
    kCmdFirstFrameMessage = 1400,
};
