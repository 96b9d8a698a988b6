#pragma once

#include <QString>

namespace mirel {

// The words of the two values of a Yes/No field, as the user set them. One pair for the whole program: grid and
// forms show the same words.
struct YesNoWords {
    QString yes = QStringLiteral("Yes");
    QString no = QStringLiteral("No");

    const QString& Of(bool truth) const { return truth ? yes : no; }

    // The pair that "Yes/No" names, split at its first "/"; a text without "/" leaves `otherwise`.
    static YesNoWords FromSetting(QStringView setting, const YesNoWords& otherwise)
    {
        const qsizetype slash = setting.indexOf(u'/');
        if (slash < 0)
            return otherwise;
        return {setting.left(slash).toString(), setting.mid(slash + 1).toString()};
    }
    QString Setting() const { return yes + u'/' + no; }

    friend bool operator==(const YesNoWords&, const YesNoWords&) = default;
};

} // namespace mirel
