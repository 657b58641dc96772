#pragma once
// Every kind of catalog item and the item lists, in one include.

#include "catalog/catalog_item.h"
#include "catalog/document_item.h"
#include "catalog/document_set.h"
#include "catalog/event_item.h"
#include "catalog/item_list.h"
#include "catalog/picture_item.h"
#include "catalog/recipe_item.h"
