#include "output/print_job.h"

#include "catalog/app_folders.h"
#include "catalog/prompt.h"
#include "catalog/text_util.h"

#include <QPageSize>
#include <QPdfWriter>

#include <cstdio>
#include <cups/cups.h>
#include <dlfcn.h>
#include <unistd.h>

int SubmitPdfToPrinter(const std::string& printerName, const std::string& pdfPath,
                       const std::string& title, std::string& error)
{
    // libcups and the two dozen libraries it needs are loaded only to print,
    // so that every other command starts quickly.
    using PrintFile = int (*)(const char*, const char*, const char*, int, cups_option_t*);
    using LastError = const char* (*)();
    void* cups = ::dlopen("libcups.so.2", RTLD_NOW | RTLD_LOCAL);
    if (!cups) {
        error = "the print system (libcups) is not installed";
        return 0;
    }
    const auto printFile = reinterpret_cast<PrintFile>(::dlsym(cups, "cupsPrintFile"));
    const auto lastError = reinterpret_cast<LastError>(::dlsym(cups, "cupsLastErrorString"));
    const int job =
        printFile ? printFile(printerName.c_str(), pdfPath.c_str(), title.c_str(), 0, nullptr) : 0;
    if (job <= 0) {
        const char* text = lastError ? lastError() : nullptr;
        error = text ? text : "the print system did not take the job";
    }
    // libcups keeps threads and state of its own; it stays loaded.
    return job > 0 ? job : 0;
}

bool RunPrintJob(CPrompt& prompt, const std::string& title,
                 const std::function<bool(QPagedPaintDevice&)>& draw)
{
    std::string printer;
    std::string pdfPath;
    if (!prompt.ChoosePrinter(printer, pdfPath))
        return false;
    const bool toQueue = !printer.empty();
    if (toQueue)
        pdfPath = CAppFolders::GetTempFolder() + "/print-" + std::to_string(::getpid()) + ".pdf";
    bool drawn;
    {
        QPdfWriter writer(QString::fromStdString(pdfPath));
        writer.setTitle(QString::fromStdString(title));
        writer.setPageSize(QPageSize(QPageSize::A4));
        drawn = draw(writer);
    }
    if (!drawn) {
        prompt.MessageBox(StrFormat("Unable to print into %s.", pdfPath.c_str()), "Print",
                          CPrompt::Icon::Stop);
        return false;
    }
    if (!toQueue)
        return true;
    std::string error;
    const int job = SubmitPdfToPrinter(printer, pdfPath, title, error);
    std::remove(pdfPath.c_str());
    if (job <= 0) {
        prompt.MessageBox(StrFormat("Unable to print on %s: %s", printer.c_str(), error.c_str()),
                          "Print", CPrompt::Icon::Stop);
        return false;
    }
    prompt.MessageBox(StrFormat("Print job #%d submitted", job), "Debug",
                      CPrompt::Icon::Information);
    return true;
}
