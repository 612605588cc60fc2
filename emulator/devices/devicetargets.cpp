#include "devices/devicetargets.h"

#include "http/answer.h"
#include "model.h"

namespace emulator {

std::vector<Target> targetsOf(const Json &body, const char *name) {
    std::vector<Target> targets;
    for (const Json &element : arrayMember(body, name))
        if (element.is_string())
            targets.push_back({element.get<std::string>(), {}});
        else if (element.is_object())
            targets.push_back({textMember(element, "id"), optionalText(element, "tid")});
        else
            throw Refusal(Code::Malformed, std::string("an element of \"") + name + "\" names no device");
    return targets;
}

std::vector<std::string> idsOf(const std::vector<Target> &targets) {
    std::vector<std::string> ids;
    for (const Target &target : targets)
        ids.push_back(target.id);
    return ids;
}

void checkKnown(const Model &model, const std::vector<Target> &targets) {
    for (const Target &target : targets)
        model.devices.get(target.id);
}

} // namespace emulator
