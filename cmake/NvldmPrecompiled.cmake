# Headers that most units read, compiled once for each kind of target and shared by all targets of that kind:
#   std          the emulator: standard library and JSON
#   core         code that knows Qt Core alone, and its tests
#   widgets      code with widgets, and its tests
# The headers of Qt Test are not among them: they depend on a macro that names each test's folder.
# A build with -DNVLDM_PRECOMPILED_HEADERS=OFF shows that every file includes what it uses.
option(NVLDM_PRECOMPILED_HEADERS "Compile the headers that most units read once" ON)

set(nvldm_std_headers
    <algorithm> <array> <chrono> <cstdint> <functional> <map> <memory> <mutex> <optional> <stdexcept> <string>
    <string_view> <thread> <unordered_map> <utility> <vector> <nlohmann/json.hpp>)
set(nvldm_core_headers
    <QByteArray> <QCoreApplication> <QDateTime> <QDebug> <QDir> <QElapsedTimer> <QFile> <QHash> <QLocale> <QObject>
    <QPointer> <QRegularExpression> <QSet> <QString> <QStringList> <QThread> <QTimer> <QVariant>)
set(nvldm_widget_headers
    <QAbstractItemModel> <QAction> <QApplication> <QCheckBox> <QComboBox> <QDialog> <QFrame> <QHeaderView> <QIcon>
    <QLabel> <QLayout> <QLineEdit> <QMenu> <QPainter> <QPushButton> <QStyledItemDelegate> <QTableWidget> <QToolButton>
    <QTreeWidget> <QWidget>)

# Compiles the headers of one kind with the options that its users have: the compiler refuses them otherwise.
function(nvldm_add_precompiled kind)
    cmake_parse_arguments(ARG "" "" "HEADERS;LIBS" ${ARGN})
    set(source "${CMAKE_BINARY_DIR}/precompiled/${kind}.cpp")
    file(CONFIGURE OUTPUT "${source}" CONTENT "// Carries the precompiled headers.\n")
    set(target nvldm_precompiled_${kind})
    add_library(${target} OBJECT "${source}")
    target_link_libraries(${target} PRIVATE ${ARG_LIBS})
    nvldm_compile_options(${target})
    if(NOT kind STREQUAL std)
        nvldm_qt_options(${target})
        set_target_properties(${target} PROPERTIES AUTOMOC OFF AUTOUIC OFF)
    endif()
    target_precompile_headers(${target} PRIVATE ${ARG_HEADERS})
endfunction()

function(nvldm_precompile target kind)
    if(NVLDM_PRECOMPILED_HEADERS)
        target_precompile_headers(${target} REUSE_FROM nvldm_precompiled_${kind})
    endif()
endfunction()

if(NVLDM_PRECOMPILED_HEADERS)
    set(core ${nvldm_std_headers} ${nvldm_core_headers})
    set(core_libs Qt6::Core nlohmann_json::nlohmann_json)
    nvldm_add_precompiled(core HEADERS ${core} LIBS ${core_libs})
    nvldm_add_precompiled(widgets HEADERS ${core} ${nvldm_widget_headers} LIBS ${core_libs} Qt6::Widgets)
    if(NVLDM_BUILD_EMULATOR)
        nvldm_add_precompiled(std HEADERS ${nvldm_std_headers} LIBS nlohmann_json::nlohmann_json)
    endif()
endif()
