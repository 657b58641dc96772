#pragma once
// Runs the built hearthbook-cli and captures what it printed.

#include <QByteArray>
#include <QStringList>

struct CliResult
{
    int exitCode = -1;
    QByteArray out;
    QByteArray err;
};

CliResult RunCli(const QStringList& arguments, const QByteArray& input = QByteArray());
