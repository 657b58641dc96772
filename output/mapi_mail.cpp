#include "output/mapi_mail.h"

#include "catalog/prompt.h"
#include "catalog/text_util.h"

#include <QProcess>
#include <QStandardPaths>
#include <QStringList>

#include <cstdlib>
#include <sys/stat.h>

CMapiMail::CMapiMail(CPrompt& prompt) : m_prompt(prompt)
{
    const char* replacement = std::getenv("HEARTHBOOK_MAIL_COMMAND");
    const QString wanted = replacement && *replacement ? QString::fromLocal8Bit(replacement)
                                                       : QStringLiteral("xdg-email");
    const QString found =
        wanted.contains(QLatin1Char('/')) ? wanted : QStandardPaths::findExecutable(wanted);
    struct stat st;
    if (found.isEmpty() || ::stat(found.toLocal8Bit().constData(), &st) != 0)
        return;
    m_program = found.toStdString();
    m_loaded = true;
}

bool CMapiMail::AddRecipient(const std::string& address)
{
    if (!m_loaded)
        return false;
    m_recipients.push_back(address);
    return true;
}

bool CMapiMail::AddAttachment(const std::string& path, const std::string& name)
{
    struct stat st;
    if (!m_loaded || ::stat(path.c_str(), &st) != 0)
        return false;
    m_attachments.push_back({path, name, 0});
    return true;
}

bool CMapiMail::SetBody(const std::string& text)
{
    m_body = text;
    return true;
}

bool CMapiMail::SetSubject(const std::string& text)
{
    m_subject = text;
    return true;
}

bool CMapiMail::Send(int flags)
{
    (void)flags; // the mail program always shows its compose window
    if (!m_loaded)
        return false;
    const int start = static_cast<int>(m_body.size());
    for (size_t i = 0; i < m_attachments.size(); ++i) {
        m_body += ' ';
        m_attachments[i].position = start + static_cast<int>(i);
    }
    QStringList arguments{QStringLiteral("--subject"), QString::fromStdString(m_subject),
                          QStringLiteral("--body"), QString::fromStdString(m_body)};
    for (const Attachment& attachment : m_attachments)
        arguments << QStringLiteral("--attach") << QString::fromStdString(attachment.path);
    for (const std::string& recipient : m_recipients)
        arguments << QString::fromStdString(recipient);

    // Started with an argument list: no shell ever sees the user's text.
    QProcess process;
    process.start(QString::fromStdString(m_program), arguments);
    if (!process.waitForStarted()) {
        m_prompt.MessageBox(
            StrFormat("Error! The mail program %s could not be started.", m_program.c_str()),
            "Send Mail", CPrompt::Icon::Stop);
        return false;
    }
    process.closeWriteChannel();
    process.waitForFinished(-1);
    if (process.exitStatus() != QProcess::NormalExit || process.exitCode() != 0) {
        m_prompt.MessageBox(
            StrFormat("Error! The mail program %s could not take the message (exit code %d).",
                      m_program.c_str(), process.exitCode()),
            "Send Mail", CPrompt::Icon::Stop);
        return false;
    }
    return true;
}

std::string CMapiMail::GetErrorName(int code)
{
    switch (code) {
    case 1:
        return "USER ABORT";
    case 2:
        return "FAILURE";
    case 3:
        return "LOGIN FAILURE";
    case 5:
        return "INSUFFICIENT MEMORY";
    case 9:
        return "TOO MANY FILES";
    case 10:
        return "TOO MANY RECIPIENTS";
    case 11:
        return "ATTACHMENT NOT FOUND";
    case 12:
        return "OPEN FAILURE";
    case 15:
        return "BAD RECIPIENT TYPE";
    case 18:
        return "TEXT TOO LARGE";
    case 21:
        return "AMBIGUOUS_RECIPIENT";
    case 25:
        return "INVALID RECIPIENTS";
    default:
        return std::string();
    }
}

std::string CMapiMail::NotAvailableText()
{
    return "Error! The mail system is not available - could not find xdg-email";
}

std::string CMapiMail::DisplayName(const std::string& path)
{
    const size_t slash = path.rfind('/');
    return slash == std::string::npos ? path : path.substr(slash + 1);
}
