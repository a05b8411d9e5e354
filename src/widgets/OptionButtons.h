#pragma once

class QRadioButton;

namespace pelmar {

// Sets an option button on or off. On turns the other buttons of its group off; off turns just
// this one off, which may leave the group with no button chosen (as a stored "False" must).
void setOptionValue(QRadioButton* button, bool on);

}  // namespace pelmar
