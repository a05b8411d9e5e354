#include "outputs/LabelStyles.h"

#include "common/Failure.h"
#include "settings/SettingsStore.h"

#include <QStringList>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

struct Field {
    const char16_t* key;
    unsigned char LabelDefRec::*member;
    unsigned char fallback;
};

constexpr Field kFields[] = {{u"Font", &LabelDefRec::Font, 0},
                             {u"FontSize", &LabelDefRec::FontSize, 9},
                             {u"FontWeight", &LabelDefRec::FontWeight, 0},
                             {u"FontUL", &LabelDefRec::FontUL, 0},
                             {u"FontItalic", &LabelDefRec::FontItalic, 0}};

bool hasFixedText(int line)
{
    return line == 11 || line == 12;
}

void save(SettingsStore& store, const QString& section, int line, const LabelDefRec& def)
{
    const auto write = [&](const QString& key, const QString& value) {
        try {
            store.setValue(kPelmarApp, section, key, value);
        } catch (const Failure&) {
            // A key that cannot be written is skipped; the others are still saved.
        }
    };
    for (const Field& field : kFields)
        write(QString::fromUtf16(field.key), QString::number(def.*field.member));
    if (hasFixedText(line))
        write(u"FixedText"_s, def.FixedText);
}

void load(const SettingsStore& store, const QString& section, int line, LabelDefRec& def)
{
    for (const Field& field : kFields) {
        const QString text
            = store.value(kPelmarApp, section, QString::fromUtf16(field.key), QString::number(field.fallback));
        if (const auto value = byteValue(text))
            def.*field.member = *value;
    }
    if (hasFixedText(line))
        def.FixedText = store.value(kPelmarApp, section, u"FixedText"_s, {});
}

QString fontName(unsigned char font)
{
    switch (font) {
    case 1: return u"David"_s;
    case 2: return u"Miriam"_s;
    default: return u"Arial (Hebrew)"_s;
    }
}

QString weightName(unsigned char weight)
{
    switch (weight) {
    case 1: return u"Bolder"_s;
    case 2: return u"Bold"_s;
    default: return u"Normal"_s;
    }
}

}  // namespace

std::optional<unsigned char> byteValue(const QString& text)
{
    bool ok = false;
    const int value = text.trimmed().toInt(&ok);
    if (!ok || value < 0 || value > 255)
        return std::nullopt;
    return static_cast<unsigned char>(value);
}

void SetGetLabelDefs(unsigned char action, SettingsStore& store, LabelDefTable& defs)
{
    for (int line = 0; line < 13; ++line) {
        const QString section = u"LabelDef"_s + QString::number(line);
        if (action == 1)
            save(store, section, line, defs[line]);
        else if (action == 2)
            load(store, section, line, defs[line]);
    }
    defs[6] = defs[3];
}

QStringList labelStyleRules(int line, const LabelDefRec& style)
{
    const QString body = u" {font-family:"_s + fontName(style.Font) + u"; font-weight:"_s + weightName(style.FontWeight)
        + u"; font-size:"_s + QString::number(style.FontSize) + u"pt; font-style:"_s
        + (style.FontItalic == 1 ? u"Italic"_s : u"Normal"_s)
        + (style.FontUL == 1 ? u"; text-decoration: underline"_s : QString());
    const QString number = QString::number(line);
    return {u" .L"_s + number + body + u"; text-align: right; direction: rtl; color:black;}"_s,
            u" .LE"_s + number + body + u"; text-align: left; direction: ltr; color:black;}"_s};
}

}  // namespace pelmar
