#pragma once

#include <QCoreApplication>

#include <memory>

// The application object of pradilon-cli. "print" measures and draws text and so needs a
// QGuiApplication (on the offscreen platform when there is no display); every other command
// stays on Qt Core.
std::unique_ptr<QCoreApplication> NeueAnwendung(int &argc, char **argv);
