#pragma once

#include <QString>

namespace mirel {

// The user's words for the two values of a Yes/No field. The whole program uses one pair: grid and forms show the
// same words.
struct YesNoWords {
    QString yes = QStringLiteral("Yes");
    QString no = QStringLiteral("No");

    const QString& Of(bool truth) const { return truth ? yes : no; }

    // The pair in a text such as "Yes/No", split at its first "/"; `otherwise` for a text without "/".
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
