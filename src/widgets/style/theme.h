#pragma once

#include <QColor>
#include <QPalette>
#include <QString>

/// The look of the program: colours, fonts and style sheets stand here and nowhere else.
namespace Theme {

inline const QColor background{0x12, 0x12, 0x12};
inline const QColor raised{0x18, 0x18, 0x18};
inline const QColor hover{0x2E, 0x2E, 0x2E};
inline const QColor hoverRow{0x20, 0x20, 0x20};
inline const QColor line{0x2A, 0x2A, 0x2A};
inline const QColor rowLine{0x1F, 0x1F, 0x1F};
inline const QColor text{0xFF, 0xFF, 0xFF};
inline const QColor textStrong{255, 255, 255, 219};
inline const QColor textDim{255, 255, 255, 191};
inline const QColor textQuiet{255, 255, 255, 140};
inline const QColor textOff{255, 255, 255, 64};
inline const QColor switchOff{0x4A, 0x4A, 0x4A};
inline const QColor dragTipText{0xF5, 0xF5, 0xF5};
inline const QColor accent{0x29, 0x86, 0xFF};
inline const QColor selection{0x29, 0x86, 0xFF, 38};
/// Laid over the rows of a tree: the current one, and the one under the pointer.
inline const QColor selectedRow{0x29, 0x86, 0xFF, 51};
inline const QColor hoverTint{255, 255, 255, 13};
inline const QColor success{0x3F, 0xB9, 0x50};
inline const QColor warning{0xF0, 0xA0, 0x20};
inline const QColor error{0xE5, 0x48, 0x4D};
/// The bars of the log's chart, told apart by their places and the legend as well.
inline const QColor chartAlarm{0xE5, 0x48, 0x4D};
inline const QColor chartEvent{0x29, 0x86, 0xFF};
inline const QColor chartAudit{0x8F, 0x9B, 0xAB};
inline const QColor chartOther{0x5A, 0x5A, 0x5A};

inline constexpr int rowHeight = 36;

/// The family of all texts but those of combo boxes.
QString fontFamily();

/// Registers the embedded fonts and lets installed ones stand in for the families that the sheets name. Needs
/// the application object.
void installFonts();

/// The dark palette, for what no sheet names.
QPalette palette();

/// The application's style sheet: combo box, check box, spin box, radio button, and then what all windows
/// share.
QString styleSheet();

} // namespace Theme
