#pragma once
// An in-memory tree for category and folder trees: records each inserted item
// and prints the tree as indented text.

#include "catalog/category.h"

#include <QString>

#include <vector>

class CTextTree : public CTreeSink
{
public:
    Handle InsertItem(Handle parent, const std::string& text) override;
    // One line per item, two blanks of indent per level, children in order.
    QString Dump() const;

private:
    struct Node
    {
        Handle parent;
        std::string text;
    };
    void DumpChildren(Handle parent, int depth, QString& out) const;
    std::vector<Node> m_nodes; // handle = index + 1
};
