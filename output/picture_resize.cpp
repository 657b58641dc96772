#include "output/picture_resize.h"

#include "catalog/picture_item.h"

CCropOffset CropOffset(int location, int W, int H, int w, int h)
{
    switch (location) {
    case CPicResizeFields::RightTop:
        return {W - w, 0};
    case CPicResizeFields::RightBottom:
        return {W - w, H - h};
    case CPicResizeFields::LeftBottom:
        return {0, H - h};
    case CPicResizeFields::LeftTop:
        return {0, 0};
    default:
        return {(W - w) / 2, (H - h) / 2};
    }
}

int ApplyResizeMode(CPictureItem& picture, const CPicResizeFields& fields)
{
    if (!picture.LoadImage(CPictureItem::kEditableForm))
        return 0;
    const int W = picture.GetImageWidth();
    const int H = picture.GetImageHeight();
    switch (fields.mode) {
    case CPicResizeFields::Scale:
        return picture.ScaleImage(fields.width, fields.height);
    case CPicResizeFields::Crop: {
        // Each picture is cropped at the location measured on its own size.
        const CCropOffset at = CropOffset(fields.cropLocation, W, H, fields.width, fields.height);
        return picture.CropImage(fields.width, fields.height, at.x, at.y);
    }
    case CPicResizeFields::Small:
        return picture.ScaleImage(W / 2, H / 2);
    case CPicResizeFields::VerySmall:
        return picture.ScaleImage(W / 4, H / 4);
    default:
        return 1;
    }
}

std::string ConvertedName(const std::string& name, const CPicResizeFields& fields)
{
    if (!fields.convert)
        return name;
    const size_t dot = name.rfind('.');
    return (dot == std::string::npos ? name : name.substr(0, dot)) + "." + fields.pictureType;
}
