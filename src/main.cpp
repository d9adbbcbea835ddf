#include "ui/Application.h"

int main(int argc, char** argv) { return qv::RunQuorvane(argc, argv); }
