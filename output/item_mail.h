#pragma once
// Mails that are not an item's own: the support mail of the Help menu.

class CPrompt;

// An empty message to the maker's support address.
bool MailSupport(CPrompt& prompt);

inline constexpr const char* kSupportAddress = "support@hearthbook.example";
