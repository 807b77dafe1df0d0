#pragma once

#include <QtGlobal>

class QString;

/// Plays a wave file and waits for its end, but never for longer than a second. Answers whether
/// the machine could play it.
///
/// It lies in a library of its own that is loaded when the first sound is wanted: what a sound
/// stands on takes longer to load than all the rest of the program.
extern "C" Q_DECL_EXPORT bool MarlowbeckPlayWave(const QString& path);
