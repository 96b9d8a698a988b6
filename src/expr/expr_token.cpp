#include "expr/expr_token.h"

namespace mirel {
namespace {

bool IsBlank(QChar c)
{
    return c == u'\t' || c == u' ' || c == u',';
}

bool IsQuote(QChar c)
{
    return c == u'\'' || c == u'"';
}

bool IsComparison(QChar c)
{
    return c == u'!' || c == u'<' || c == u'=' || c == u'>';
}

bool StandsAlone(QChar c)
{
    return QStringView(u"()*+-/^%").contains(c);
}

// Collects one token from the place where it begins.
class TokenReader {
public:
    TokenReader(QStringView text, qsizetype position, ExprMode mode)
        : text_(text)
        , start_(position)
        , position_(position)
        , mode_(mode)
    {
    }

    QString Read()
    {
        const QChar first = text_[start_];
        if (IsQuote(first))
            return RunTo(first, start_ + 1);
        if (first == u'[' || text_.sliced(start_).startsWith(u"&["))
            return RunToBracket(start_);
        if (StandsAlone(first)) {
            ++position_;
            return Collected();
        }
        if (IsComparison(first) && mode_ == ExprMode::Condition)
            return WithComparison();
        return ReadWord();
    }

    qsizetype Position() const { return position_; }

private:
    QString Collected() const { return text_.sliced(start_, position_ - start_).toString(); }

    // The token up to and with the next `last`, or to the end of the text.
    QString RunTo(QChar last, qsizetype from)
    {
        const qsizetype at = text_.indexOf(last, from);
        position_ = at < 0 ? text_.size() : at + 1;
        return Collected();
    }

    // Between brackets "]]" is a "]" of the name.
    QString RunToBracket(qsizetype from)
    {
        QString token = RunTo(u']', from);
        while (position_ < text_.size() && text_[position_] == u']' && text_.indexOf(u']', position_ + 1) > 0)
            token = RunTo(u']', position_ + 1);
        return token;
    }

    // The token so far with the comparison character at this place, and the one that may follow after blanks.
    QString WithComparison()
    {
        const bool onlyEqual = mode_ == ExprMode::Condition && text_[position_] == u'!';
        ++position_;
        QString token = Collected();
        position_ = SkipExpressionBlanks(text_, position_);
        const QStringView mayFollow = onlyEqual ? u"=" : u"=<>";
        if (position_ < text_.size() && mayFollow.contains(text_[position_]))
            token += text_[position_++];
        return token;
    }

    QString ReadWord()
    {
        for (; position_ < text_.size(); ++position_) {
            const QChar c = text_[position_];
            if (c == u'[')
                return RunToBracket(position_);
            if (IsBlank(c) || StandsAlone(c))
                break;
            if (!IsComparison(c))
                continue;
            if (mode_ == ExprMode::Condition)
                break;
            return WithComparison();
        }
        return Collected();
    }

    QStringView text_;
    qsizetype start_;
    qsizetype position_;
    ExprMode mode_;
};

// The first character at depth 0 and outside quotes that `wanted` takes; a closing parenthesis there ends the
// search in any case.
template <typename Wanted>
qsizetype FindOutside(QStringView text, qsizetype from, Wanted wanted)
{
    int depth = 0;
    bool quoted = false;
    for (qsizetype i = from; i < text.size(); ++i) {
        const QChar c = text[i];
        if (IsQuote(c))
            quoted = !quoted;
        if (quoted)
            continue;
        if (depth == 0 && (c == u')' || wanted(c)))
            return i;
        if (c == u'(')
            ++depth;
        else if (c == u')')
            --depth;
    }
    return -1;
}

} // namespace

qsizetype SkipExpressionBlanks(QStringView text, qsizetype position)
{
    while (position < text.size() && IsBlank(text[position]))
        ++position;
    return position;
}

std::optional<ExprToken> NextExpressionToken(QStringView text, qsizetype& position, ExprMode mode)
{
    position = SkipExpressionBlanks(text, position);
    if (position >= text.size())
        return {};
    TokenReader reader(text, position, mode);
    ExprToken token{reader.Read(), position};
    position = reader.Position();
    return token;
}

QString BareName(QStringView written)
{
    QString name;
    bool inside = false;
    for (qsizetype i = 0; i < written.size(); ++i) {
        const QChar c = written[i];
        const bool isDoubled = inside && c == u']' && i + 1 < written.size() && written[i + 1] == u']';
        if (isDoubled)
            ++i;
        if (isDoubled || (c != u']' && (inside || c != u'[')))
            name += c;
        else
            inside = c == u'[';
    }
    return name;
}

qsizetype FindClosingParenthesis(QStringView text, qsizetype from)
{
    return FindOutside(text, from, [](QChar) { return false; });
}

qsizetype FindArgumentEnd(QStringView text, qsizetype from)
{
    return FindOutside(text, from, [](QChar c) { return c == u','; });
}

} // namespace mirel
