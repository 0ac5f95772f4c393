#pragma once

// What becomes of the values of one column on their way into the files.

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

bool isEmpty(const Column& column, const AnsweredClass& answered);

/// A sentence for each way in which values are changed: texts that are cut or longer than the
/// column, integers that do not survive 32 bits.
std::vector<std::string> lossesIn(const Column& column, const AnsweredClass& answered,
                                  const Velm::Properties& texts);

/// Whether the width of a text column is only a guess.
bool lacksSize(const Column& column, const AnsweredClass& answered, const Velm::Properties& texts);

}  // namespace sennetctl
