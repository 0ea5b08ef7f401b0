#pragma once
// STUB: replaced by the safe save.
