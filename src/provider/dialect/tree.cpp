#include "provider/dialect/tree.h"

namespace mirel::dialect {

Binding BindingOf(Operation operation)
{
    switch (operation) {
    case Operation::Or:
        return Binding::Or;
    case Operation::And:
        return Binding::And;
    case Operation::Not:
        return Binding::Not;
    case Operation::Equal:
    case Operation::NotEqual:
    case Operation::Less:
    case Operation::LessEqual:
    case Operation::Greater:
    case Operation::GreaterEqual:
    case Operation::Like:
    case Operation::NotLike:
    case Operation::In:
    case Operation::NotIn:
    case Operation::Between:
    case Operation::NotBetween:
    case Operation::IsNull:
    case Operation::IsNotNull:
    case Operation::IsTrue:
    case Operation::IsNotTrue:
    case Operation::IsFalse:
    case Operation::IsNotFalse:
        return Binding::Comparison;
    case Operation::Join:
    case Operation::Concat:
        return Binding::Text;
    case Operation::Add:
    case Operation::Subtract:
        return Binding::Sum;
    case Operation::Multiply:
    case Operation::Divide:
    case Operation::Remainder:
        return Binding::Product;
    case Operation::Negate:
        return Binding::Sign;
    case Operation::Null:
    case Operation::True:
    case Operation::False:
    case Operation::Number:
    case Operation::Text:
    case Operation::Date:
    case Operation::Column:
    case Operation::AllColumns:
    case Operation::Call:
        return Binding::Operand;
    }
    return Binding::Operand;
}

} // namespace mirel::dialect
