include(Platform/WindowsCE-GNU)
windows_ce_gnu(C)
