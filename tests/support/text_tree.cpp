#include "tests/support/text_tree.h"

CTreeSink::Handle CTextTree::InsertItem(Handle parent, const std::string& text)
{
    m_nodes.push_back({parent, text});
    return m_nodes.size();
}

QString CTextTree::Dump() const
{
    QString out;
    DumpChildren(0, 0, out);
    return out;
}

void CTextTree::DumpChildren(Handle parent, int depth, QString& out) const
{
    for (size_t i = 0; i < m_nodes.size(); ++i) {
        if (m_nodes[i].parent != parent)
            continue;
        out += QString(depth * 2, QLatin1Char(' ')) + QString::fromStdString(m_nodes[i].text) +
               QLatin1Char('\n');
        DumpChildren(i + 1, depth + 1, out);
    }
}
