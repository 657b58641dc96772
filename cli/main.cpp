// hearthbook-cli: the catalog on the command line, on the same core as the
// desktop program.

#include "catalog/tallowmere_doc.h"
#include "cli/cli_command.h"
#include "cli/console_prompt.h"

#include <QGuiApplication>
#include <QTextStream>

#include <cstdio>
#include <memory>

namespace {

const CliCommand* FindCommand(const QString& name)
{
    for (const CliCommand& command : CliCommands()) {
        if (command.name == name)
            return &command;
    }
    return nullptr;
}

// The command name is the first argument that is neither an option nor the
// value of a global option.
int CommandIndex(const QStringList& args)
{
    for (int i = 1; i < args.size(); ++i) {
        const QString& a = args.at(i);
        if (a == QLatin1String("--home") || a == QLatin1String("--catalog")) {
            ++i;
            continue;
        }
        if (a.startsWith(QLatin1Char('-')))
            continue;
        return i;
    }
    return -1;
}

QString GeneralHelp(QCommandLineParser& parser)
{
    QString text = parser.helpText();
    text += QStringLiteral("\nCommands:\n");
    for (const CliCommand& command : CliCommands()) {
        const QString head = command.name + QLatin1Char(' ') + command.synopsis;
        text += QStringLiteral("  %1\n      %2\n").arg(head.trimmed(), command.description);
    }
    text += QStringLiteral("\nExit codes: 0 done, 1 usage, 2 the catalog cannot be opened or "
                           "read, 3 any other failure.\n"
                           "Run 'hearthbook-cli COMMAND --help' for a command's options.\n");
    return text;
}

// Qt's own notes about the offscreen session mean nothing to a command-line user.
void QuietMessages(QtMsgType type, const QMessageLogContext& context, const QString& message)
{
    if (type == QtWarningMsg && message.startsWith(QLatin1String("QStandardPaths: ")))
        return;
    (void)context;
    std::fprintf(stderr, "%s\n", qPrintable(message));
}

} // namespace

int main(int argc, char** argv)
{
    QStringList args;
    for (int i = 0; i < argc; ++i)
        args << QString::fromLocal8Bit(argv[i]);
    const int index = CommandIndex(args);
    const CliCommand* command = index > 0 ? FindCommand(args.at(index)) : nullptr;

    // Pictures and printing need the GUI application object, which takes a
    // tenth of a second to start; the command line never shows a window, so
    // it runs offscreen, and only for the commands that need it.
    std::unique_ptr<QCoreApplication> app;
    if (command && command->needsGui) {
        if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
            qputenv("QT_QPA_PLATFORM", "offscreen");
        qInstallMessageHandler(QuietMessages);
        app = std::make_unique<QGuiApplication>(argc, argv);
    } else {
        app = std::make_unique<QCoreApplication>(argc, argv);
    }
    QCoreApplication::setOrganizationName(QStringLiteral("Veltrano"));
    QCoreApplication::setApplicationName(QStringLiteral("Hearthbook"));
    QCoreApplication::setApplicationVersion(QStringLiteral("1.3.11"));

    QCommandLineParser parser;
    parser.setApplicationDescription(
        QStringLiteral("Hearthbook catalog on the command line.\n"
                       "The catalog is <install>/User Data/HearthbookInfo.hbi, where the "
                       "install folder is --home, else $HEARTHBOOK_HOME, else the InstallPath "
                       "setting, else $XDG_DATA_HOME/Hearthbook."));
    parser.setSingleDashWordOptionMode(QCommandLineParser::ParseAsLongOptions);
    const QCommandLineOption homeOption(QStringLiteral("home"),
                                        QStringLiteral("Install folder of the catalog."),
                                        QStringLiteral("DIR"));
    const QCommandLineOption catalogOption(QStringLiteral("catalog"),
                                           QStringLiteral("The catalog data file itself."),
                                           QStringLiteral("FILE"));
    const QCommandLineOption helpOption(QStringList{QStringLiteral("h"), QStringLiteral("help")},
                                        QStringLiteral("Show this help."));
    const QCommandLineOption versionOption(QStringLiteral("version"),
                                           QStringLiteral("Show the version."));
    parser.addOption(homeOption);
    parser.addOption(catalogOption);
    parser.addOption(helpOption);
    parser.addOption(versionOption);

    if (command) {
        parser.addPositionalArgument(command->name, command->description,
                                     command->name + QLatin1Char(' ') + command->synopsis);
        if (command->addOptions)
            command->addOptions(parser);
    }

    QTextStream err(stderr);
    if (!parser.parse(args)) {
        err << "hearthbook-cli: " << parser.errorText() << "\n";
        return kExitUsage;
    }
    if (parser.isSet(versionOption)) {
        std::printf("hearthbook-cli %s\n", qPrintable(QCoreApplication::applicationVersion()));
        return kExitOk;
    }
    if (parser.isSet(helpOption)) {
        std::fputs(qPrintable(command ? parser.helpText() : GeneralHelp(parser)), stdout);
        return kExitOk;
    }
    if (!command) {
        if (index > 0)
            err << "hearthbook-cli: unknown command '" << args.at(index) << "'\n";
        else
            err << "hearthbook-cli: no command given\n";
        err << "Run 'hearthbook-cli --help' for the commands.\n";
        return kExitUsage;
    }

    const CAppFolders folders = parser.isSet(homeOption)
                                    ? CAppFolders(parser.value(homeOption).toStdString())
                                    : CAppFolders();
    const std::string catalogPath = parser.isSet(catalogOption)
                                        ? parser.value(catalogOption).toStdString()
                                        : folders.GetDataFilePath();
    CConsolePrompt prompt;
    QStringList positional = parser.positionalArguments();
    positional.removeFirst(); // the command name
    CliContext context{parser, positional, folders, catalogPath, prompt};
    return command->run(context);
}
