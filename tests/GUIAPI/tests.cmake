# The stalled web sync takes its full two minutes.
set_tests_properties(tst_synctimeout PROPERTIES LABELS "long;backend" TIMEOUT 240 COST 1000)
# (a high cost starts it first, so the rest of the suite runs beside it)
foreach(_t tst_datamanager tst_datamanagerstartup tst_measureapi tst_syncobject tst_systemapi)
    set_tests_properties(${_t} PROPERTIES LABELS "backend")
endforeach()
