#pragma once

// One column of a script as the server and the resource properties describe it.

#include <Pegasus/Common/CIMProperty.h>
#include <Velm/Properties.h>

#include <optional>
#include <string>
#include <vector>

#include "script/AnsweredClass.h"

namespace sennetctl {

struct Column {
    Pegasus::CIMName name;
    std::optional<Pegasus::CIMProperty> declared;  // none when only instances have it
};

/// None when neither the class nor an instance has the property.
std::optional<Column> columnOf(const AnsweredClass& answered, const std::string& property);

/// Whether the class declares the property with this qualifier.
bool hasQualifier(const Column& column, const char* name);

bool isEmpty(const Column& column, const AnsweredClass& answered);

/// The width that the resource properties give; 0 for none and for what is no number.
std::size_t givenSize(const Column& column, const AnsweredClass& answered,
                      const Velm::Properties& texts);

/// The width that the resource properties give, else the class, in characters; 0 for none and for
/// what is no number.
std::size_t declaredSize(const Column& column, const AnsweredClass& answered,
                         const Velm::Properties& texts);

/// Whether the width of a text column is only a guess.
bool lacksSize(const Column& column, const AnsweredClass& answered, const Velm::Properties& texts);

}  // namespace sennetctl
