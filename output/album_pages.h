#pragma once
// Photo album web pages: the thumbnail fit rule and the "Save Photo Album"
// command around CPhotoAlbum::CreateWebPages.

#include <string>

class CPhotoAlbum;
class CPrompt;

struct CThumbnailBox
{
    int width;
    int height;
};

// 0 Small 150 x 150, 1 Medium 200 x 200, 2 Large 250 x 200, else Medium.
CThumbnailBox AlbumThumbnailBox(int thumbnailSize);

// The image cell's width and height for a picture of pictureWidth x
// pictureHeight in the box. A picture whose size cannot be read fills the box.
CThumbnailBox AlbumThumbnailSize(int pictureWidth, int pictureHeight, CThumbnailBox box);

// The index file's base name: the title's first word, made safe, else "Title".
std::string AlbumIndexBaseName(const std::string& title);

// Asks for a folder, writes the album's pages there and tells the user how
// it went. With folder given, no folder is asked for.
bool SaveAlbumWebPages(CPrompt& prompt, CPhotoAlbum& album, const std::string& folder = {});
