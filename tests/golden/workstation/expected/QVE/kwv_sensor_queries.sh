echo "Creating query 'Sensors_And_Their_Log_Of_Readings' in $QUERY_LIB..." 
echo "Creating query 'Sensors_And_Their_Log_Of_Readings' in $QUERY_LIB..." >> $DBDIR/tmp/kwvinstall.log 
qvmkquery -d "Sensors_And_Their_Log_Of_Readings" -r inventory -v KWX_VSensors_And_Their_Log_hc3 \
   -c QVE_OBJECT_LABEL \
   -c Name \
   -c indx \
   -c Shift \
   -c Margin \
   -c Balance \
   -c Ratio \
   -c resourc_ \
   -c level_ \
   -c LowestPermittedOperatingVoltag \
   -c LowestPermittedOperatingVoltag11 \
   -c TemperatureOfSensorOne \
   -c TemperatureOfSensorTwo \
   -c Name14 \
   -c Label \
   -c Caption \
   -c Kind \
   -c State \
   -c Note \
   -c Mark \
   -c Active \
   -c Built \
   -c Holder \
   -c Name1424 \
   -c Flags \
   -c Octets \
   -c Shifts \
   -c Ports \
   -c Steps \
   -c Counts \
   -c Deltas \
   -c Totals \
   -c Factors \
   -c Weights \
   -c Marks \
   -c Texts \
   -c Moments \
"$QUERY_LIB" "Sensors And Their Log Of Readings" 2>> $DBDIR/tmp/kwvinstall.log
ERR=$?
if [ $ERR -ne 0 ] ; then
   echo "'Sensors And Their Log Of Readings' query already exists."
fi
