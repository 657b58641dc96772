#pragma once
// Sends a finished PDF to a CUPS print queue.

#include <string>

// The job id (greater than 0), or 0 with error set.
int SubmitPdfToPrinter(const std::string& printerName, const std::string& pdfPath,
                       const std::string& title, std::string& error);
