drop table KWX_Sensors_And_Their_Log_hc3 cascade constraints ;

create table KWX_Sensors_And_Their_Log_hc3 (
   HARDWARE_SYSTEM_ID varchar2(64) NOT NULL,
   CONFIG_CHANGE_TYPE varchar2(12) NOT NULL,
   CONFIG_CHANGE_TIME varchar2(32) NOT NULL,
   Row_Index varchar2(5) NOT NULL,
   Name varchar2(24) NULL,
   indx varchar2(20) NULL,
   Shift varchar2(20) NULL,
   Margin varchar2(20) NULL,
   Balance varchar2(20) NULL,
   Ratio varchar2(32) NULL,
   resourc_ varchar2(255) NULL,
   level_ varchar2(255) NULL,
   LowestPermittedOperatingVoltag varchar2(32) NULL,
   LowestPermittedOperatingVoltag11 varchar2(32) NULL,
   TemperatureOfSensorOne varchar2(20) NULL,
   TemperatureOfSensorTwo varchar2(20) NULL,
   Name14 varchar2(16) NULL,
   Label varchar2(12) NULL,
   Caption varchar2(255) NULL,
   Kind varchar2(255) NULL,
   State varchar2(255) NULL,
   Note varchar2(255) NULL,
   Mark varchar2(32) NULL,
   Active varchar2(32) NULL,
   Built varchar2(25) NULL,
   Holder varchar2(32) NULL,
   Name1424 varchar2(255) NULL,
   Flags varchar2(40) NULL,
   Octets varchar2(255) NULL,
   Shifts varchar2(255) NULL,
   Ports varchar2(255) NULL,
   Steps varchar2(255) NULL,
   Counts varchar2(255) NULL,
   Deltas varchar2(255) NULL,
   Totals varchar2(255) NULL,
   Factors varchar2(255) NULL,
   Weights varchar2(255) NULL,
   Marks varchar2(255) NULL,
   Texts varchar2(255) NULL,
   Moments varchar2(255) NULL );

create unique index KWX_ISensors_And_Their_Log_hc3 on KWX_Sensors_And_Their_Log_hc3
(
   HARDWARE_SYSTEM_ID,
   CONFIG_CHANGE_TYPE,
   CONFIG_CHANGE_TIME,
   Row_Index
);

alter table KWX_Sensors_And_Their_Log_hc3 add ( primary key ( HARDWARE_SYSTEM_ID, CONFIG_CHANGE_TYPE, Row_Index ));

drop view KWX_VSensors_And_Their_Log_hc3;

create view KWX_VSensors_And_Their_Log_hc3
as
select
   COMPUTER_SYSTEM.QVE_OBJECT_ID,
   COMPUTER_SYSTEM.QVE_OBJECT_LABEL,
   KWX_Sensors_And_Their_Log_hc3.*
from
   COMPUTER_SYSTEM, KWX_Sensors_And_Their_Log_hc3
where
   COMPUTER_SYSTEM.HARDWARE_SYSTEM_ID =
   KWX_Sensors_And_Their_Log_hc3.HARDWARE_SYSTEM_ID;

insert into QUERY_VIEWS (VIEW_NAME) values ('KWX_VSensors_And_Their_Log_hc3');
