#include "device_targets.h"

#include "answer.h"
#include "model.h"

namespace emulator {

std::vector<Target> targetsOf(const Json &body) {
    std::vector<Target> targets;
    for (const Json &element : arrayMember(body, "devices")) {
        if (element.is_string()) {
            targets.push_back({element.get<std::string>(), {}});
        } else if (element.is_object()) {
            targets.push_back({textMember(element, "id"), optionalText(element, "tid")});
        } else {
            throw Refusal(Code::Malformed, "an element of \"devices\" names no device");
        }
    }
    return targets;
}

void checkKnown(const Model &model, const std::vector<Target> &targets) {
    for (const Target &target : targets) {
        model.devices.get(target.id);
    }
}

} // namespace emulator
