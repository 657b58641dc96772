#pragma once
// A catalog in a temporary folder with a scripted prompt and the command
// layer on it, plus helpers to make files for the commands to find.

#include "catalog/tallowmere_doc.h"
#include "tests/support/scripted_prompt.h"
#include "views/command_env.h"

#include <QTemporaryDir>

#include <string>

class CCommandFixture
{
public:
    // 2003-07-05 14:07:00 UTC: archive names end in -0307051407 (tests run in UTC).
    static constexpr int64_t kNow = 1057414020;
    static constexpr const char* kStamp = "0307051407";

    CCommandFixture();

    // The temporary folder (no trailing '/').
    std::string Root() const;
    std::string Home() const { return Root() + "/home"; }
    std::string ArchiveRoot() const { return Home() + "/Archive"; }
    // Writes a file below the root (making its folders); returns its full path.
    std::string MakeFile(const std::string& relative, const std::string& content = "x");
    std::string MakeFolder(const std::string& relative);
    // Scripts the next "Select Folder" to choose folder with the given options.
    void ScriptLoad(const std::string& folder, bool unique, bool archive = false);

    QTemporaryDir dir;
    CScriptedPrompt prompt;
    CAppFolders folders;
    CTallowmereDoc doc;
    CCommandEnv env;
};
