#pragma once

#include <QPixmap>

// The toolbar pictures, 24 x 22 pixels in the 16 standard colours, drawn here rather than loaded,
// each with its own button border.
enum class Motiv { Oeffnen, Speichern, Drucken, Frage, Blatt, Hilfe };
enum class Bildzustand { Up, Down, Dis };

inline constexpr int BildBreite = 24;
inline constexpr int BildHoehe = 22;

QPixmap Werkzeugbild(Motiv motiv, Bildzustand zustand);
