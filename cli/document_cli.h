#pragma once
// What the document commands of hearthbook-cli share: the catalog opened with
// the dialog answers, the command layer on it, and saving when it changed.

#include "catalog/tallowmere_doc.h"
#include "cli/cli_command.h"
#include "cli/dialog_answers.h"
#include "output/output_services.h"
#include "views/command_env.h"
#include "views/list_rows.h"

#include <memory>

class CDocumentCli
{
public:
    explicit CDocumentCli(CliContext& context, CPrompt::Answer questions = CPrompt::Answer::No);

    // Opens the catalog; false after the message (exit kExitCatalog).
    bool Open();
    // Saves when a command changed the catalog; the exit code.
    int Finish();

    CTallowmereDoc& Doc() { return *m_doc; }
    CCommandEnv& Env() { return *m_env; }
    CDialogAnswers& Answers() { return m_answers; }

    // Whether a category path names a root or a category of the catalog.
    bool CategoryExists(const std::string& path) const;
    // The catalog's document or picture with a sequence number, or nullptr.
    std::shared_ptr<CDocumentItem> FindEntry(int32_t sequence) const;
    // Sequence numbers from the arguments from index first on; false after a
    // usage message.
    bool ParseSequences(int first, std::vector<int32_t>& sequences, int& exitCode) const;

private:
    CliContext& m_context;
    CDialogAnswers m_answers;
    std::unique_ptr<CTallowmereDoc> m_doc;
    std::unique_ptr<CCommandEnv> m_env;
    COutputServices m_services;
};

// Prints a row: its cells separated by tabs, on one line.
void PrintRow(const CListRow& row);
// An absolute form of a path given on the command line.
std::string AbsolutePath(const QString& path);
