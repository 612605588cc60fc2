#pragma once

/// The operations whose dialogs the console only asks for.
enum class UploadKind {
    Firmware,
    Package,
    Configuration,
    HttpsCertificate,
    IeeeCertificate,
    CertificateList, ///< shows the certificates in use
    DebugInfo,
    QuickSetup
};
