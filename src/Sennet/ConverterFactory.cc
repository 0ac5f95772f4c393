#include "Sennet/ConverterFactory.h"

#include "SennetConverter/framework/CimConverter.h"
#include "SennetConverter/framework/NameRules.h"
#include "SennetConverter/mif/CaSennetConverter.h"
#include "SennetConverter/mif/LdmsSennetConverter.h"
#include "SennetConverter/mif/QveLumoSennetConverter.h"
#include "SennetConverter/mif/QveSennetConverter.h"
#include "SennetConverter/mif/SmsSennetConverter.h"
#include "SennetConverter/shell/Cim2ShConverter.h"
#include "SennetConverter/shell/LumoCim2ShConverter.h"
#include "SennetConverter/sql/LumoCim2SqlConverter.h"
#include "SennetConverter/sql/MSCim2SqlConverter.h"
#include "SennetConverter/sql/OracleCim2SqlConverter.h"
#include "SennetConverter/sql/SybaseCim2SqlConverter.h"

using namespace Pegasus;

namespace {

constexpr int kCombinedQveConverters = 2;

template <typename Converter>
void add(CimConverterList& converters, const String& file, const Velm::Properties& properties,
         unsigned int maxNameLength = kLongestName) {
    converters.addConverter(new Converter(file, properties, maxNameLength));
}

// The two combined MIF converters stay; those of the previous script go.
void keepCombinedConverters(CimConverterList& converters) {
    CimConverter* const qve = converters.getConverter(0);
    CimConverter* const lumo = converters.getConverter(1);
    for (int i = kCombinedQveConverters; i < converters.getNumberOfConverters(); ++i) {
        delete converters.getConverter(i);
    }
    converters.clear();
    converters.addConverter(qve);
    converters.addConverter(lumo);
}

void createQveConverters(CimConverterList& converters, const String& mifDirectory,
                         const String& sqlDirectory, const String& scriptName,
                         const Velm::Properties& properties) {
    if (converters.getNumberOfConverters() == 0) {
        auto* const qve =
            new QveSennetConverter(mifDirectory + "/kwvinv.mif", properties, kLongestName);
        converters.addConverter(qve);
        auto* const lumo = new QveLumoSennetConverter(mifDirectory + "/kwinvlumo.mif", properties,
                                                      kLongestLumoName);
        converters.addConverter(lumo);
        // They differ in names only.
        qve->shareRows(*lumo);
    } else {
        keepCombinedConverters(converters);
    }
    const String stem = sqlDirectory + "/kwv_" + scriptName;
    add<MSCim2SqlConverter>(converters, stem + "_ms_schema.sql", properties);
    add<OracleCim2SqlConverter>(converters, stem + "_oracle_schema.sql", properties);
    add<SybaseCim2SqlConverter>(converters, stem + "_sybase_schema.sql", properties);
    add<LumoCim2SqlConverter>(converters, stem + "_lumo_schema.sql", properties, kLongestLumoName);
    add<Cim2ShConverter>(converters, stem + "_queries.sh", properties);
    add<LumoCim2ShConverter>(converters, stem + "_queries_lumo.sh", properties, kLongestLumoName);
}

}  // namespace

void createCimConverters(CimConverterList& converters, const String& mifType,
                         const String& mifDirectory, const String& sqlDirectory,
                         const String& scriptName, const Velm::Properties& properties) {
    const String scriptFile = mifDirectory + "/" + scriptName + ".mif";
    if (String::equalNoCase(mifType, "/SMS")) {
        converters.clearAndDelete();
        add<SmsSennetConverter>(converters, scriptFile, properties);
    } else if (String::equalNoCase(mifType, "/LD")) {
        converters.clearAndDelete();
        add<LdmsSennetConverter>(converters, scriptFile, properties);
    } else if (String::equalNoCase(mifType, "/CA")) {
        if (converters.getNumberOfConverters() == 0) {
            add<CaSennetConverter>(converters, mifDirectory + "/kwvinv.mif", properties);
        }
    } else if (String::equalNoCase(mifType, "/QVE")) {
        createQveConverters(converters, mifDirectory, sqlDirectory, scriptName, properties);
    }
}
