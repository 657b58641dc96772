#include "catalog/prompt.h"

#include <QDesktopServices>
#include <QString>
#include <QUrl>

bool CPrompt::OpenWithShell(const std::string& path)
{
    return QDesktopServices::openUrl(QUrl::fromLocalFile(QString::fromStdString(path)));
}
