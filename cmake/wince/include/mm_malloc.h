// Vector memory of a processor that the device does not have; the platform headers ask for it.
#pragma once
