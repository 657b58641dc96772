#pragma once
// The items the preview panes show: the last selected document and picture,
// and the current event, recipe and document set by sequence number (a new
// one, not yet filed, is held here while a pane edits it).

#include "catalog/catalog_items.h"

#include <memory>

struct CCurrentItems
{
    std::shared_ptr<CDocumentItem> document;
    std::shared_ptr<CPictureItem> picture;
    int32_t eventSequence = 0;
    int32_t recipeSequence = 0;
    int32_t documentSetSequence = 0;
    // A new data item a pane edits before it is filed; it is then the
    // current item of its kind.
    std::unique_ptr<CCatalogItem> pending;
};
