#include "FormattedField.h"

FormattedField::FormattedField(int type, int width, int decimals, const char *align)
{
    field.VariableName = QStringLiteral("V");
    field.Type = type;
    field.Width = width;
    field.Decimals = decimals;
    field.Align = QString::fromLatin1(align);
}

QString FormattedField::of(int kind, const void *value) const
{
    kareport::FormatOptions used = options;
    used.settings = &settings;
    kareport::TextBuffer out;
    out.append(u"before");
    kareport::FieldFormatter(field).append(out, used, static_cast<kareport::ValueKind>(kind), value, suffix);
    return out.from(0).startsWith(u"before") ? out.from(6).toString()
                                             : QStringLiteral("what was there before was changed");
}
