/// @file
/// The part of an outside program that is compiled for a processor with fused multiply-add.
#pragma once

/// Compares what the library's headers and functions give here with arithmetic that rounds after each operation.
///
/// @return whether all bits are the same, and the inputs such that a fused operation would have changed them
bool GivesTheSameBits();
