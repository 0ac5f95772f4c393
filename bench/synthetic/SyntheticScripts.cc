#include "bench/synthetic/SyntheticScripts.h"

#include <fstream>
#include <stdexcept>
#include <string>

namespace bench {

namespace {

void writeText(const std::filesystem::path& path, const std::string& text) {
    std::ofstream file(path, std::ios::binary);
    file << text;
    if (!file.flush()) {
        throw std::runtime_error("cannot write " + path.string());
    }
}

std::string script(const SyntheticClass& synthetic) {
    std::string text = "[DEFAULT]\ntitle=" + synthetic.name + "\n\n[CIM]\nG[0]=" + synthetic.name +
                       "\nN[0]=root/cimv2\nA[0]=";
    for (const SyntheticProperty& property : synthetic.properties) {
        text += (&property == synthetic.properties.data() ? "" : ",") + property.name;
    }
    return text + "\n";
}

std::string resources(const SyntheticClass& synthetic) {
    std::string text;
    for (const SyntheticProperty& property : synthetic.properties) {
        const std::string key = synthetic.name + "." + property.name;
        text += key + "=The " + property.name + "\n";
        if (property.kind == Kind::Text) {
            text += key + ".Size=64\n";
        }
    }
    return text;
}

}  // namespace

void writeScripts(const std::filesystem::path& directory,
                  const std::vector<SyntheticClass>& classes) {
    std::string properties;
    for (const SyntheticClass& synthetic : classes) {
        writeText(directory / (synthetic.name + ".script.inv"), script(synthetic));
        properties += resources(synthetic);
    }
    writeText(directory / "sennet.properties", properties);
}

}  // namespace bench
