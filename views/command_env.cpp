#include "views/command_env.h"

#include "catalog/progress.h"
#include "catalog/tallowmere_doc.h"

CCommandEnv::CCommandEnv(CTallowmereDoc& doc) : m_doc(doc) {}

CPrompt& CCommandEnv::Prompt() const
{
    return m_doc.GetPrompt();
}

CProgress& CCommandEnv::Progress() const
{
    static CProgress silent;
    return m_progress ? *m_progress : silent;
}
