#include "tables/taskcodes.h"

#include "simulation/random.h"

#include <iterator>
#include <sstream>

namespace emulator {

namespace {

std::vector<std::string> wordsOf(const char *text) {
    std::istringstream stream(text);
    return {std::istream_iterator<std::string>(stream), {}};
}

} // namespace

const std::vector<std::string> &taskTypes() {
    static const auto types =
        wordsOf("deviceConfigFileUpload deviceFWUpgrade deviceGenSelfSignedCert deviceHttpsCertInstall "
                "deviceHttpsCertsAndPKeys deviceIEEE_EAP_PEAP deviceIEEE_EAP_TLS devicePackageUpload "
                "deviceAssignIPAuto deviceAssignIPManual deviceExportDeviceInfo deviceQuickSetup "
                "deviceRestart deviceRestore deviceChangePass devicePassPolicy deviceCreateTemplate "
                "deviceSetTemplate deviceCustomCommand");
    return types;
}

std::string failureCode(Random &random) {
    // Those that end in an underscore go on with the number of a slot.
    static const auto codes = wordsOf(
        "pTaskMismatchingStatus pTaskUnsupportedMethod pTaskMismatchingPrivateKeyAndCertificate "
        "pTaskInvalidFileOrPublicKey pTaskCertificateNotInstalled pTaskNotInstalled "
        "pTaskDeviceResponseTimeout pTaskDeviceResponseTimeoutEx pTaskFailedToConnectToDevice "
        "pTaskFailedToConnectToDeviceEx pTaskFailedToSetPassword pTaskInvalidFileForThisModelGroup "
        "pTaskIncompatibleFirmware pTaskNoSdCardDetected pTaskSdCardError_ pTaskMaxPackageUploadLimit_ "
        "pTaskInsufficientStorage_ pTaskBrokenFile_ pInternalProcessError_");
    const std::string &code = codes[random.below(codes.size())];
    const std::uint64_t slot = 1 + random.below(16);
    return code.ends_with('_') ? code + (slot < 10 ? "0" : "") + std::to_string(slot) : code;
}

} // namespace emulator
