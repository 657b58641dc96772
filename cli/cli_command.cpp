#include "cli/cli_command.h"

#include "catalog/tallowmere_doc.h"
#include "cli/console_prompt.h"

#include <QTextStream>

std::vector<CliCommand>& CliCommands()
{
    static std::vector<CliCommand> commands;
    return commands;
}

CliRegistration::CliRegistration(CliCommand command)
{
    CliCommands().push_back(std::move(command));
}

std::unique_ptr<CTallowmereDoc> CliContext::OpenCatalog() const
{
    auto doc = std::make_unique<CTallowmereDoc>(prompt, folders, catalogPath);
    if (!doc->OpenCatalog(false))
        return nullptr;
    return doc;
}

int CliContext::Usage(const QString& message) const
{
    QTextStream err(stderr);
    err << "hearthbook-cli: " << message << "\n"
        << "Run 'hearthbook-cli " << parser.positionalArguments().value(0)
        << " --help' for its usage.\n";
    return kExitUsage;
}

int CliContext::Failure(const QString& message) const
{
    QTextStream err(stderr);
    err << "hearthbook-cli: " << message << "\n";
    return kExitFailure;
}
