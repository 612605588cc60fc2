#pragma once

#include <QTest>

#ifdef QT_WIDGETS_LIB
#include <QApplication>
#endif

/// Registers a Qt Test class under the name of its source file. The tests of a folder are one program, whose
/// first argument names the one to run; the others go to Qt Test.
class TestProgram {
public:
    using Main = int (*)(int argc, char *argv[]);

    TestProgram(const char *sourceFile, Main main);
};

template <typename Test>
int runAppless(int argc, char *argv[]) {
    Test test;
    return QTest::qExec(&test, argc, argv);
}

template <typename Test, typename Application>
int runTest(int argc, char *argv[]) {
    Application application(argc, argv);
    application.setAttribute(Qt::AA_Use96Dpi, true);
    return runAppless<Test>(argc, argv);
}

/// In place of QTEST_MAIN, QTEST_GUILESS_MAIN and QTEST_APPLESS_MAIN.
#define NVLDM_TEST(Test) static const TestProgram registered##Test(__FILE__, &runTest<Test, QApplication>);
#define NVLDM_GUILESS_TEST(Test)                                                                             \
    static const TestProgram registered##Test(__FILE__, &runTest<Test, QCoreApplication>);
#define NVLDM_APPLESS_TEST(Test) static const TestProgram registered##Test(__FILE__, &runAppless<Test>);
