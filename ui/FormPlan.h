#pragma once

#include <QWidget>

struct InitMini;

// The plan view: lists the plan line by line. The main window shows it with
// ZeigeSekundaerfenster; "OK" closes it.
class FormPlan : public QWidget
{
    Q_OBJECT
public:
    explicit FormPlan(const InitMini &daten, QWidget *parent = nullptr);

    // The designed client area; the window opener sizes the window by it.
    QSize sizeHint() const override;
};
