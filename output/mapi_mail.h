#pragma once
// One mail message handed to the user's mail program (xdg-email, or the
// program named by $HEARTHBOOK_MAIL_COMMAND) with its subject, body,
// recipients and attachments. The program only offers the message; the user
// sends it from the mail program's compose window.

#include <string>
#include <vector>

class CPrompt;

class CMapiMail
{
public:
    struct Attachment
    {
        std::string path;
        std::string name;
        int position = 0; // where in the body the attachment stands
    };

    static constexpr int kMapiDialog = 8;

    explicit CMapiMail(CPrompt& prompt);

    // False when no mail program could be found; every operation then fails.
    bool IsLoaded() const { return m_loaded; }
    bool AddRecipient(const std::string& address);
    // False when no file exists at path; the attachment is then left out.
    bool AddAttachment(const std::string& path, const std::string& name);
    bool SetBody(const std::string& text);
    bool SetSubject(const std::string& text);
    // Hands the message over; a failed hand-over is reported to the user.
    bool Send(int flags = kMapiDialog);

    static std::string GetErrorName(int code);
    // The message for a mail system that cannot be found.
    static std::string NotAvailableText();
    // The part of a path after its last '/'.
    static std::string DisplayName(const std::string& path);

    const std::string& GetProgram() const { return m_program; }
    const std::vector<std::string>& GetRecipients() const { return m_recipients; }
    const std::vector<Attachment>& GetAttachments() const { return m_attachments; }
    const std::string& GetBody() const { return m_body; }
    const std::string& GetSubject() const { return m_subject; }

private:
    CPrompt& m_prompt;
    bool m_loaded = false;
    std::string m_program;
    std::vector<std::string> m_recipients;
    std::vector<Attachment> m_attachments;
    std::string m_body;
    std::string m_subject;
};
