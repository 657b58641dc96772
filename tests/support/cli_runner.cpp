#include "tests/support/cli_runner.h"

#include <QProcess>
#include <QTest>

CliResult RunCli(const QStringList& arguments, const QByteArray& input)
{
    QProcess process;
    process.start(QStringLiteral(HB_CLI_PATH), arguments);
    CliResult result;
    if (!process.waitForStarted(10000)) {
        qWarning("hearthbook-cli did not start");
        return result;
    }
    if (!input.isEmpty())
        process.write(input);
    process.closeWriteChannel();
    if (!process.waitForFinished(120000)) {
        process.kill();
        qWarning("hearthbook-cli did not finish");
        return result;
    }
    result.exitCode = process.exitStatus() == QProcess::NormalExit ? process.exitCode() : -2;
    result.out = process.readAllStandardOutput();
    result.err = process.readAllStandardError();
    return result;
}
