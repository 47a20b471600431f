#pragma once

#include "Filters/TaskBase.h"
#include "Settings/EGUIMode.h"

#include <QLocale>

namespace orvela {

/// The windows in the language of the user. Texts of tables are marked where they stand and translated where
/// they are shown; as keys of the settings store and on the command line they stay as they are.
namespace Translations {

enum Texts { WithToolkit, WindowsOnly };

/// Has every window that is made from now on speak the first language of `locale` that there is a catalogue
/// of, or that the texts are written in. An earlier language is taken away. It needs an application object.
/// @param texts  whether the toolkit's own texts are translated, too, which a host may have done
/// @return that language, "en" where there is no other
QString install(const QLocale& locale = QLocale::system(), Texts texts = WithToolkit);

/// Takes away the language that was installed.
void remove();

/// The languages of the catalogues, such as "de".
QStringList languages();

/// The mode's name as it is shown.
QString modeName(EGUIMode mode);

/// The title of a pipeline's step as it is shown; empty for null.
QString stepTitle(const char* title);

/// Why a task or a run failed, as it is shown.
QString causeOf(const Failure& failure);

} // namespace Translations

} // namespace orvela
