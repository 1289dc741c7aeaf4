#pragma once

#include <functional>

class QWidget;

// Shows a secondary window (info, file browser, settings, print dialog, plan view) without
// blocking: the main window is disabled while it is open, and every way of closing it (button,
// Escape, close box) enables the main window again and then runs beimSchliessen (which restores
// the toolbar image). The window is deleted when it closes; the next opening builds it afresh.
void ZeigeSekundaerfenster(QWidget *fenster, QWidget *hauptfenster, std::function<void()> beimSchliessen = {});
