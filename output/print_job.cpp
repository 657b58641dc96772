#include "output/print_job.h"

#include <cups/cups.h>

int SubmitPdfToPrinter(const std::string& printerName, const std::string& pdfPath,
                       const std::string& title, std::string& error)
{
    const int job = cupsPrintFile(printerName.c_str(), pdfPath.c_str(), title.c_str(), 0, nullptr);
    if (job <= 0) {
        const char* text = cupsLastErrorString();
        error = text ? text : "the print system did not take the job";
        return 0;
    }
    return job;
}
