#pragma once
// A catalog in a temporary install folder, with a scripted prompt.

#include "catalog/tallowmere_doc.h"
#include "tests/support/scripted_prompt.h"

#include <QByteArray>
#include <QTemporaryDir>

#include <memory>

class CCatalogFixture
{
public:
    CCatalogFixture();

    std::string Home() const;
    std::string DataFile() const;
    void WriteDataFile(const QByteArray& bytes) const;
    QByteArray ReadDataFile() const;
    // A fresh document on the fixture's folders (not opened).
    std::unique_ptr<CTallowmereDoc> NewDoc();
    // A fresh document that has read the data file; fails the test when it cannot.
    std::unique_ptr<CTallowmereDoc> Open();

    QTemporaryDir dir;
    CScriptedPrompt prompt;
};
