// Mail hand-over: the records given to the mail program, and what the user
// is told when there is none or it fails.

#include "catalog/app_context.h"
#include "catalog/catalog_items.h"
#include "output/item_mail.h"
#include "output/mapi_mail.h"
#include "output/output_services.h"
#include "tests/support/scripted_prompt.h"

#include <QFile>
#include <QTemporaryDir>
#include <QtTest>

class TestMail : public QObject
{
    Q_OBJECT

    QTemporaryDir m_dir;

    QString RecordPath() const { return m_dir.path() + "/record"; }

    // The arguments the mail program was started with; empty when it was not.
    QStringList Recorded()
    {
        QFile file(RecordPath());
        if (!file.open(QIODevice::ReadOnly))
            return {};
        QStringList args = QString::fromUtf8(file.readAll()).split(QChar('\0'));
        args.removeLast();
        file.remove();
        return args;
    }

    QString MakeFile(const QString& name)
    {
        QFile file(m_dir.path() + "/" + name);
        file.open(QIODevice::WriteOnly);
        file.write("x");
        return file.fileName();
    }

private slots:
    void init()
    {
        qputenv("HEARTHBOOK_MAIL_COMMAND", HB_TEST_DATA "/mail-recorder.sh");
        qputenv("HB_MAIL_RECORD", RecordPath().toLocal8Bit());
        qunsetenv("HB_MAIL_EXIT");
        QFile::remove(RecordPath());
    }

    void attachmentsStandAtTheEndOfTheBody()
    {
        CScriptedPrompt prompt;
        CMapiMail mail(prompt);
        QVERIFY(mail.IsLoaded());
        const QString a = MakeFile("a.txt");
        const QString b = MakeFile("b c.jpg");
        mail.SetBody("Hi");
        QVERIFY(mail.AddAttachment(a.toStdString(), "a.txt"));
        QVERIFY(!mail.AddAttachment((m_dir.path() + "/gone.txt").toStdString(), "gone.txt"));
        QVERIFY(mail.AddAttachment(b.toStdString(), "b c.jpg"));
        QVERIFY(mail.Send());
        QCOMPARE(mail.GetBody(), std::string("Hi  "));
        QCOMPARE(mail.GetAttachments().size(), size_t(2));
        QCOMPARE(mail.GetAttachments()[0].position, 2);
        QCOMPARE(mail.GetAttachments()[1].position, 3);
        QCOMPARE(Recorded(),
                 (QStringList{"--subject", "", "--body", "Hi  ", "--attach", a, "--attach", b}));
        QVERIFY(prompt.shown.empty());
    }

    void bodyWithoutAttachmentsIsUnchanged()
    {
        CScriptedPrompt prompt;
        CMapiMail mail(prompt);
        mail.SetBody("Hello; rm -rf / `x` $(y)");
        QVERIFY(mail.Send());
        QCOMPARE(Recorded(), (QStringList{"--subject", "", "--body", "Hello; rm -rf / `x` $(y)"}));
    }

    void itemMails()
    {
        CScriptedPrompt prompt;
        CAppContext context(prompt, CAppFolders(m_dir.path().toStdString()));
        CEventItem event;
        event.SetEventName("Party");
        event.SetOccasion("New Year");
        event.Mail(context);
        QStringList args = Recorded();
        QCOMPARE(args.value(3), QString::fromStdString(event.GetMailText()));
        QVERIFY(args.value(3).startsWith("Party was for New Year.\n"));

        CDocumentSet set;
        set.SetDescription("Taxes 2003");
        for (const char* name : {"one.pdf", "two.pdf", "three.pdf"}) {
            auto member = std::make_shared<CDocumentItem>();
            member->SetPathname(MakeFile(name).toStdString());
            set.GetMembers().Append(member);
        }
        QFile::remove(m_dir.path() + "/two.pdf"); // a deleted member is left out
        set.Mail(context);
        QCOMPARE(Recorded(),
                 (QStringList{"--subject", "", "--body", "Taxes 2003  ", "--attach",
                              m_dir.path() + "/one.pdf", "--attach", m_dir.path() + "/three.pdf"}));
        QVERIFY(MailSupport(prompt));
        QCOMPARE(Recorded(), (QStringList{"--subject", "Hearthbook support issue", "--body", "",
                                          "support@hearthbook.example"}));
        QVERIFY(prompt.shown.empty());
    }

    void documentsThroughTheCommandLayer()
    {
        CScriptedPrompt prompt;
        CMailProgram service(prompt);
        QVERIFY(service.IsAvailable());
        const QString letter = MakeFile("letter.pdf");
        QVERIFY(service.SendDocuments({{letter.toStdString(), "letter.pdf"},
                                       {(m_dir.path() + "/gone.pdf").toStdString(), "gone.pdf"}}));
        QCOMPARE(Recorded(), (QStringList{"--subject", "", "--body", " ", "--attach", letter}));
        qputenv("HEARTHBOOK_MAIL_COMMAND", "hearthbook-no-such-mail-program");
        QVERIFY(!service.IsAvailable());
    }

    void noMailProgram()
    {
        qputenv("HEARTHBOOK_MAIL_COMMAND", "hearthbook-no-such-mail-program");
        CScriptedPrompt prompt;
        CAppContext context(prompt, CAppFolders(m_dir.path().toStdString()));
        CRecipeItem recipe;
        recipe.Mail(context); // says nothing
        QVERIFY(prompt.shown.empty());
        CEventItem event;
        event.Mail(context);
        QCOMPARE(prompt.Only().text,
                 std::string("Error! The mail system is not available - could not find xdg-email"));
        QCOMPARE(prompt.Only().caption, std::string("Send Mail"));
        QCOMPARE(prompt.Only().icon, CPrompt::Icon::Stop);
        QVERIFY(!MailSupport(prompt));
        QCOMPARE(prompt.shown.size(), size_t(2));
    }

    void failedHandOverIsReported()
    {
        qputenv("HB_MAIL_EXIT", "4");
        CScriptedPrompt prompt;
        CAppContext context(prompt, CAppFolders(m_dir.path().toStdString()));
        CRecipeItem recipe;
        recipe.SetDish("Pie");
        recipe.Mail(context);
        QCOMPARE(prompt.Only().caption, std::string("Send Mail"));
        QVERIFY(prompt.Only().text.find("exit code 4") != std::string::npos);
    }

    void errorNames()
    {
        QCOMPARE(CMapiMail::GetErrorName(1), std::string("USER ABORT"));
        QCOMPARE(CMapiMail::GetErrorName(21), std::string("AMBIGUOUS_RECIPIENT"));
        QCOMPARE(CMapiMail::GetErrorName(25), std::string("INVALID RECIPIENTS"));
        QCOMPARE(CMapiMail::GetErrorName(4), std::string());
    }
};

QTEST_GUILESS_MAIN(TestMail)
#include "tst_mail.moc"
