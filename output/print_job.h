#pragma once
// A print job: the print dialog, the pages drawn into a PDF (the user's file,
// or a temporary one handed to the CUPS queue chosen), and the job number.

#include <functional>
#include <string>

class CPrompt;
class QPagedPaintDevice;

// draw paints every page (calling newPage between them); false when it could
// not. False when the dialog was cancelled or the job failed (the user is told).
bool RunPrintJob(CPrompt& prompt, const std::string& title,
                 const std::function<bool(QPagedPaintDevice&)>& draw);

// The job id (greater than 0), or 0 with error set.
int SubmitPdfToPrinter(const std::string& printerName, const std::string& pdfPath,
                       const std::string& title, std::string& error);
