#include "devices/firmwareimage.h"
#include "devices/packageupload.h"
#include "http/endpoint.h"
#include "http/utf8path.h"
#include "tasks/taskwork.h"

namespace emulator {

namespace {

UploadOrder orderOf(const Call &call, const char *type) {
    UploadOrder order;
    order.account = call.session.account;
    order.taskId = filledTextMember(call.body, "tid");
    order.type = type;
    order.files = call.files;
    return order;
}

const UploadedFile &imageOf(const Call &call) {
    if (call.files.size() != 1 || call.files.front().part != "fimage")
        throw Refusal(Code::Malformed, "the form needs one file, \"fimage\"");
    return call.files.front();
}

void startFirmware(Service &service, const UploadOrder &order, const UploadedFile &file) {
    const FirmwareImage image(file);
    startUpload(service, order, [&](const Device &device, const Json &) { return image.workOf(device); });
}

Response uploadFirmware(Service &service, const Call &call) {
    startFirmware(service, orderOf(call, "deviceFWUpgrade"), imageOf(call));
    return {};
}

/// The caller runs on this machine and names the file instead of sending it.
Response readFirmware(Service &service, const Call &call) {
    const UploadedFile file =
        localFile(pathOf(filledTextMember(call.body, "local")), filledTextMember(call.body, "localn"));
    UploadOrder order = orderOf(call, "deviceFWUpgrade");
    order.files = {&file, 1};
    startFirmware(service, order, file);
    return {};
}

Response uploadConfiguration(Service &service, const Call &call) {
    UploadOrder order = orderOf(call, "deviceConfigFileUpload");
    order.deviceIds = idsOf(targetsOf(call.body, "device_ids"));
    const bool isEmpty = imageOf(call).size == 0;
    startUpload(service, order, [&](const Device &device, const Json &) {
        DeviceWork work;
        work.id = device.id;
        work.restarts = true;
        work.failure = isEmpty ? "pTaskBrokenFile_01" : "";
        return work;
    });
    return {};
}

Response uploadPackage(Service &service, const Call &call) {
    UploadOrder order = orderOf(call, "devicePackageUpload");
    order.deviceIds = idsOf(targetsOf(call.body, "device_ids"));
    const Json &onCard = member(call.body, "sd_card");
    if (!onCard.is_boolean())
        throw Refusal(Code::Malformed, "\"sd_card\" is no boolean");
    const UploadedFile &file = imageOf(call);
    startUpload(service, order, [&](const Device &device, const Json &) {
        return packageWork(file, onCard == true, device);
    });
    return {};
}

} // namespace

Endpoints uploadEndpoints() {
    return {
        {"POST", "/v1/fwupl", Role::Writer, &uploadFirmware, Body::Form},
        {"POST", "/v1/fwuplex", Role::Writer, &readFirmware, Body::Form},
        {"POST", "/v1/config_file_upload", Role::Writer, &uploadConfiguration, Body::Form},
        {"POST", "/v1/upload_package", Role::Writer, &uploadPackage, Body::Form},
    };
}

} // namespace emulator
