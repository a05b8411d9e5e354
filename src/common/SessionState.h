#pragma once

#include <QString>
#include <QStringList>
#include <QVector>

#include <array>

namespace pelmar {

// One chosen (or not) card group of the group picker.
struct CardGroupSel {
    short GroupCode = 0;
    bool Selected = false;
};

// The style of one label line. Fields are 0..255; the fixed text is used by lines 11 and 12.
struct LabelDefRec {
    unsigned char Font = 0;  // 0 Arial, 1 David, 2 Miriam
    unsigned char FontSize = 0;  // points
    unsigned char FontWeight = 0;  // 0 Normal, 1 Bolder, 2 Bold
    unsigned char FontUL = 0;  // 1 underlined
    unsigned char FontItalic = 0;  // 1 italic
    QString FixedText;
    bool operator==(const LabelDefRec&) const = default;
};

// The state the parts of the program share for the life of the process: the connection
// settings, the schema level, the stop flag, the hand-picked cards, the picker selections and the
// label styles. One instance is made by the window or the command line and handed to the runs,
// the control and its dialogs; tests make their own, so no state leaks from one test into the
// next.
struct SessionState {
    // Connection settings ("Params" keys of the same names).
    QString ConnServer;
    QString ConnUID;
    QString ConnPWD;
    QString ConnDataBase;

    // Schema level of the company database: 0 older, 1 newer, -1 unreadable.
    short SboVersionLevel = 0;

    // Set by the stop button; cleared by every click of the run button.
    bool StopRequested = false;

    // The card picker's list statement; empty means "build it afresh".
    QString CardListSQL;

    // The selected-card list: the codes in the order added; duplicates allowed.
    QStringList WantedCrd;

    // Card groups of the group picker: entry 0 is the unused empty entry, 1..n the rows.
    QVector<CardGroupSel> SelCardGroups{CardGroupSel{}};
    short GroupCardType = -1;

    // Properties 1..64 (index 0 unused) and how they combine ("AND", "OR", or "" for AND).
    std::array<bool, 65> QryGroupSel{};
    QString QryGroupRelation;

    // Styles of the thirteen label lines; line 6 (department) always equals line 3 (contact).
    std::array<LabelDefRec, 13> LabelDefs{};

    int WantedCrdCount() const { return static_cast<int>(WantedCrd.size()); }
    void clearCardGroups() { SelCardGroups = {CardGroupSel{}}; }
};

}  // namespace pelmar
