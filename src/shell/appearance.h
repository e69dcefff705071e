// Light or dark: as the desktop has it, or as the user wants it.
#pragma once

#include <QString>

enum class Appearance
{
    System,
    Light,
    Dark
};

/// What the user chose last.
Appearance ChosenAppearance();
/// All windows look so from now on, and those of the next start.
void ChooseAppearance(Appearance appearance);
/// At the start of the program.
void ApplyChosenAppearance();
