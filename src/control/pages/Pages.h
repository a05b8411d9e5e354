#pragma once

class QString;
class QToolButton;
class QWidget;

namespace pelmar {

struct MainCardControls;
class ClickableLabel;

// The five pages of the control, in tab order. Each creates its controls, records them in
// controls and returns the page; the caller owns the page.
QWidget* buildLabelPage(MainCardControls& controls);
QWidget* buildLettersPage(MainCardControls& controls);
QWidget* buildEmailPage(MainCardControls& controls);
QWidget* buildCriteriaPage(MainCardControls& controls);
QWidget* buildGeneralPage(MainCardControls& controls);

// The strip below the pages: output type, run, preview, save, stop and the progress display.
QWidget* buildCommandStrip(MainCardControls& controls);

// A picture button that picks a file; named "CmdDir_<index>".
QToolButton* folderButton(int index, const QString& toolTip);

}  // namespace pelmar
