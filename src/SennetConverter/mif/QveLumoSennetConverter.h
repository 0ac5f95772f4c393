#pragma once

#include "SennetConverter/mif/QveSennetConverter.h"

namespace Pegasus {

/// The QVE document for the Lumo database, whose names are short: words are abbreviated.
class QveLumoSennetConverter : public QveSennetConverter {
  public:
    using QveSennetConverter::QveSennetConverter;

    String substituteValues(String text) override;
};

}  // namespace Pegasus
