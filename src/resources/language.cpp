#include "resources/language.h"

#include "resources/string_rows.h"

#include <QXmlStreamReader>

#include <algorithm>
#include <utility>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

std::optional<LanguageTexts>& Spoken()
{
    static std::optional<LanguageTexts> texts;
    return texts;
}

// Writers of XML know one line end; the system's texts have the handheld's.
QString WithLineEndsOf(const StringRow& row, QString text)
{
    return row.text.find(u"\r\n") == row.text.npos ? text : text.replace(u'\n', u"\r\n"_s);
}

} // namespace

// Reads the messages of a file one after the other.
class LanguageReader {
public:
    explicit LanguageReader(QByteArrayView bytes)
        : xml_(QByteArray::fromRawData(bytes.data(), bytes.size()))
    {
    }

    bool Read(LanguageTexts& texts)
    {
        if (!xml_.readNextStartElement() || xml_.name() != u"TS")
            return false;
        texts.code_ = xml_.attributes().value(u"language"_s).toString();
        texts.plurals_ = PluralRuleOf(texts.code_);
        while (!xml_.atEnd()) {
            if (xml_.readNext() == QXmlStreamReader::StartElement && xml_.name() == u"message")
                ReadMessage(texts);
        }
        if (xml_.hasError())
            return false;
        std::ranges::stable_sort(texts.entries_, {}, &LanguageTexts::Entry::id);
        return true;
    }

private:
    void ReadMessage(LanguageTexts& texts)
    {
        bool isNumber = false;
        const StringRow* row = FindStringRow(Str(xml_.attributes().value(u"id"_s).toInt(&isNumber)));
        while (xml_.readNextStartElement()) {
            if (!row || !isNumber || xml_.name() != u"translation")
                xml_.skipCurrentElement();
            else
                ReadTranslation(*row, texts);
        }
    }

    void ReadTranslation(const StringRow& row, LanguageTexts& texts)
    {
        const auto type = xml_.attributes().value(u"type"_s);
        const bool isGone = type == u"vanished" || type == u"obsolete";
        QStringList forms;
        QString text;
        while (!xml_.atEnd() && xml_.readNext() != QXmlStreamReader::EndElement) {
            if (xml_.isCharacters())
                text += xml_.text();
            else if (xml_.isStartElement() && xml_.name() == u"numerusform")
                forms += xml_.readElementText(QXmlStreamReader::SkipChildElements);
            else if (xml_.isStartElement())
                xml_.skipCurrentElement();
        }
        if (forms.isEmpty())
            forms += text;
        const bool isWhole = std::ranges::none_of(forms, [](const QString& form) { return form.isEmpty(); });
        if (isGone || !isWhole)
            return;
        for (QString& form : forms)
            form = WithLineEndsOf(row, std::move(form));
        texts.entries_.push_back({row.id, forms});
    }

    QXmlStreamReader xml_;
};

std::optional<LanguageTexts> LanguageTexts::Read(QByteArrayView bytes)
{
    LanguageTexts texts;
    if (bytes.size() > kLargestFileBytes || !LanguageReader(bytes).Read(texts))
        return std::nullopt;
    return texts;
}

QStringView LanguageTexts::Pattern(Str id, quint64 count) const
{
    const auto entry = std::ranges::lower_bound(entries_, id, {}, &Entry::id);
    if (entry == entries_.end() || entry->id != id)
        return {};
    const qsizetype form = std::min<qsizetype>(plurals_.formOf(count), entry->forms.size() - 1);
    return entry->forms[form];
}

void Speak(std::optional<LanguageTexts> texts)
{
    Spoken() = std::move(texts);
}

const LanguageTexts* SpokenLanguage()
{
    const std::optional<LanguageTexts>& texts = Spoken();
    return texts ? &*texts : nullptr;
}

} // namespace mirel
