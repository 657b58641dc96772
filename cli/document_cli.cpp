#include "cli/document_cli.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

#include <cstdio>

CDocumentCli::CDocumentCli(CliContext& context, CPrompt::Answer questions)
    : m_context(context), m_answers(questions), m_services(m_answers)
{}

bool CDocumentCli::Open()
{
    m_doc = std::make_unique<CTallowmereDoc>(m_answers, m_context.folders, m_context.catalogPath);
    if (!m_doc->OpenCatalog(false))
        return false;
    m_env = std::make_unique<CCommandEnv>(*m_doc);
    m_services.InstallInto(*m_env);
    return true;
}

int CDocumentCli::Finish()
{
    if (m_env->Changed() && !m_doc->SaveCatalog(false))
        return kExitFailure;
    return m_answers.ErrorCount() > 0 ? kExitFailure : kExitOk;
}

bool CDocumentCli::CategoryExists(const std::string& path) const
{
    for (const CCategory& root : m_doc->GetRootCategories()) {
        if (root.GetName() == path)
            return true;
    }
    const size_t slash = path.rfind('\\');
    return slash != std::string::npos &&
           m_doc->GetCategories().Exists(path.substr(slash + 1), path.substr(0, slash));
}

std::shared_ptr<CDocumentItem> CDocumentCli::FindEntry(int32_t sequence) const
{
    for (const CItemList* list : {&m_doc->GetPictures(), &m_doc->GetDocuments()}) {
        for (const auto& item : *list) {
            if (item->GetSequenceNumber() == sequence)
                return item;
        }
    }
    return nullptr;
}

bool CDocumentCli::ParseSequences(int first, std::vector<int32_t>& sequences, int& exitCode) const
{
    for (int i = first; i < m_context.arguments.size(); ++i) {
        bool ok = false;
        const int value = m_context.arguments.at(i).toInt(&ok);
        if (!ok || value <= 0) {
            exitCode = m_context.Usage(
                QStringLiteral("'%1' is not a sequence number").arg(m_context.arguments.at(i)));
            return false;
        }
        sequences.push_back(value);
    }
    if (sequences.empty()) {
        exitCode = m_context.Usage(QStringLiteral("no sequence number given"));
        return false;
    }
    return true;
}

void PrintRow(const CListRow& row)
{
    std::string line;
    for (size_t i = 0; i < row.cells.size(); ++i) {
        if (i > 0)
            line += '\t';
        line += row.cells[i];
    }
    line += '\n';
    std::fwrite(line.data(), 1, line.size(), stdout);
}

std::string AbsolutePath(const QString& path)
{
    return QFile::encodeName(QDir::cleanPath(QFileInfo(path).absoluteFilePath())).toStdString();
}
