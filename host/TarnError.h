#pragma once
#include <exception>

class TarnError : public std::exception {};

void FailMemFullError();
