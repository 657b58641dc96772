#pragma once
// The prompt of the command line: messages are printed (results on stdout,
// warnings and errors on stderr); questions take the answer given up front.

#include "catalog/prompt.h"

#include <cstdio>

class CConsolePrompt : public CPrompt
{
public:
    explicit CConsolePrompt(Answer questionAnswer = Answer::No) : m_questionAnswer(questionAnswer)
    {
    }

    Answer MessageBox(const std::string& text, const std::string& caption, Icon icon,
                      Buttons buttons) override;

    // How many errors (stop or exclamation messages) were shown.
    int ErrorCount() const { return m_errors; }

private:
    Answer m_questionAnswer;
    int m_errors = 0;
};
