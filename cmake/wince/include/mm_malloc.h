// Stands in for a header of another processor's vector memory; the platform headers include it.
#pragma once
