#pragma once
// The command table of hearthbook-cli: each command file registers its
// commands with their options and a run function.

#include "catalog/app_folders.h"

#include <QCommandLineParser>
#include <QStringList>

#include <functional>
#include <memory>
#include <string>
#include <vector>

class CConsolePrompt;
class CTallowmereDoc;

enum CliExit
{
    kExitOk = 0,
    kExitUsage = 1,
    kExitCatalog = 2,
    kExitFailure = 3
};

struct CliContext
{
    QCommandLineParser& parser;
    QStringList arguments; // the positional arguments after the command name
    CAppFolders folders;
    std::string catalogPath;
    CConsolePrompt& prompt;

    // Opens the catalog for a command (not creating it); nullptr after the
    // message when it cannot be opened or read.
    std::unique_ptr<CTallowmereDoc> OpenCatalog() const;
    // Prints a usage error for this command; returns kExitUsage.
    int Usage(const QString& message) const;
    // Prints an error; returns kExitFailure.
    int Failure(const QString& message) const;
};

struct CliCommand
{
    QString name;
    QString synopsis;    // arguments after the name, for the help text
    QString description; // one line
    std::function<void(QCommandLineParser&)> addOptions;
    std::function<int(CliContext&)> run;
    // Pictures, fonts and printing need the (offscreen) GUI application.
    bool needsGui = false;
};

std::vector<CliCommand>& CliCommands();

// Registers a command at start-up: static CliRegistration r{{...}};
struct CliRegistration
{
    explicit CliRegistration(CliCommand command);
};
