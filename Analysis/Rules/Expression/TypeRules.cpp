// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Expression/TypeRules.h"

namespace velmora {

namespace {

using Kind = ExpressionType::Kind;
using Operation = ExpressionNode::Operation;

std::string bothTypes(const ExpressionType& left, const ExpressionType& right) {
    return "got " + describe(left) + " and " + describe(right);
}

bool isOrdering(Operation operation) {
    return operation != Operation::Equal && operation != Operation::Unequal && operation != Operation::In;
}

bool canBeText(const ExpressionType& type) {
    return type.kind == Kind::Text || type.kind == Kind::Enumeration || type.kind == Kind::Any;
}

/// Levels in dBm differ by dB.
Result<ExpressionType> sumType(Operation operation, const ExpressionType& left, const ExpressionType& right) {
    const bool isDifference = operation == Operation::Subtract;
    if (left.isPlain && right.isPlain)
        return left;
    if (right.isPlain || (left.isPlain && (!isDifference || right.unit != Unit::DBm)))
        return right.isPlain ? left : right;
    if (left.unit == Unit::DBm && right.unit == Unit::DB)
        return left;
    if (left.unit == Unit::DBm && right.unit == Unit::DBm && isDifference)
        return numberType(Unit::DB);
    if (left.unit == Unit::DB && right.unit == Unit::DBm && !isDifference)
        return right;
    if (left.unit == right.unit && left.unit != Unit::DBm)
        return left.isPlain ? right : left;
    return Failure{bothTypes(left, right) + ", wanted " +
                   (isDifference ? "the same unit, or dB less from dBm" : "the same unit, or dBm and dB")};
}

Result<ExpressionType> productType(const ExpressionType& left, const ExpressionType& right) {
    if (left.unit != Unit::None && right.unit != Unit::None)
        return Failure{bothTypes(left, right) + ", wanted at most one with a unit"};
    return numberType(left.unit == Unit::None ? right.unit : left.unit, left.isPlain && right.isPlain);
}

Result<ExpressionType> quotientType(const ExpressionType& left, const ExpressionType& right) {
    if (right.unit == Unit::None)
        return numberType(left.unit, left.isPlain && right.isPlain);
    if (left.unit == right.unit)
        return numberType(Unit::None, true);
    return Failure{bothTypes(left, right) + ", wanted the same unit, or none in the divisor"};
}

} // namespace

bool canBeNumber(const ExpressionType& type) {
    return type.kind == Kind::Number || type.kind == Kind::Any || type.kind == Kind::Enumeration;
}

std::string comparisonMistake(Operation operation, const ExpressionType& left, const ExpressionType& right) {
    if (left.kind == Kind::Truth || right.kind == Kind::Truth)
        return bothTypes(left, right) + ", wanted numbers or texts: a condition needs no comparison";
    const bool areNumbers = canBeNumber(left) && canBeNumber(right);
    const bool areTexts = canBeText(left) && canBeText(right);
    if (!areNumbers && !areTexts)
        return bothTypes(left, right) + ", wanted two numbers or two texts";
    if (!areNumbers && isOrdering(operation))
        return bothTypes(left, right) + ", wanted == or != between texts";
    if (left.kind != Kind::Number || right.kind != Kind::Number || left.isPlain || right.isPlain)
        return {};
    return left.unit == right.unit ? std::string() : bothTypes(left, right) + ", wanted the same unit";
}

Result<ExpressionType> arithmeticType(Operation operation, const ExpressionType& left,
                                      const ExpressionType& right) {
    for (const ExpressionType& each : {left, right})
        if (each.kind != Kind::Number && each.kind != Kind::Any)
            return Failure{"got " + describe(each) + ", wanted a number"};
    if (left.kind == Kind::Any || right.kind == Kind::Any)
        return ExpressionType{Kind::Any};
    switch (operation) {
    case Operation::Multiply: return productType(left, right);
    case Operation::Divide: return quotientType(left, right);
    default: return sumType(operation, left, right);
    }
}

} // namespace velmora
