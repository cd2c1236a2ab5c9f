#pragma once

#include <QString>

// The title of the box that refuses a second instance.
QString DuplicateInstanceTitle();
// Its text: five lines and one empty line, lines ended by CR LF.
QString DuplicateInstanceText();
// Shows the box and waits for OK.
void ShowDuplicateInstanceMessage();
