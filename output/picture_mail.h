#pragma once
// Mailing pictures, resized or converted first when the user asks.

#include <string>
#include <vector>

class CPictureItem;
class CPrompt;

// The photo view's mail command: every picture attached, after the convert
// question. False when nothing was handed over.
bool MailPictures(CPrompt& prompt, const std::vector<CPictureItem*>& pictures);

// The per-user folder converted pictures and album pages are made in
// ("" when it cannot be made).
std::string MailWorkFolder();
