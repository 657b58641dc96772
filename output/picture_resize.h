#pragma once
// Applying a "Resize/Convert Picture(s)" choice to one picture's editable image.

#include "catalog/dialog_fields.h"

class CPictureItem;

struct CCropOffset
{
    int x;
    int y;
};

// Where a w x h block sits in a W x H picture for a crop location.
CCropOffset CropOffset(int location, int pictureWidth, int pictureHeight, int width, int height);

// Loads the picture's editable form and scales or crops it by the mode:
// scale to width x height, crop at the location, half or a quarter of each side.
// 1 done (or nothing to do for another mode), 0 when the picture cannot be changed.
int ApplyResizeMode(CPictureItem& picture, const CPicResizeFields& fields);

// name with its extension replaced by the picture type when converting.
std::string ConvertedName(const std::string& name, const CPicResizeFields& fields);
