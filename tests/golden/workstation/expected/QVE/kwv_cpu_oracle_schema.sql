drop table KWX_Processor_Data cascade constraints ;

create table KWX_Processor_Data (
   HARDWARE_SYSTEM_ID varchar2(64) NOT NULL,
   CONFIG_CHANGE_TYPE varchar2(12) NOT NULL,
   CONFIG_CHANGE_TIME varchar2(32) NOT NULL,
   Row_Index varchar2(5) NOT NULL,
   Processor_identifier__unique_ varchar2(64) NULL,
   Family varchar2(255) NULL,
   CPUStatus varchar2(255) NULL,
   Family5 varchar2(255) NULL,
   MaxClockSpeed varchar2(20) NULL,
   CacheSize varchar2(20) NULL,
   LoadPercentage varchar2(20) NULL,
   Temperature varchar2(20) NULL,
   Cooled varchar2(32) NULL,
   Voltage varchar2(32) NULL,
   Grade varchar2(32) NULL,
   InstallDate varchar2(25) NULL,
   Uptime varchar2(25) NULL,
   PowerManagementCapabilities varchar2(255) NULL,
   Numbers varchar2(255) NULL,
   Notes varchar2(255) NULL,
   Host varchar2(32) NULL,
   SerialNumber varchar2(12) NULL,
   Elsewhere varchar2(255) NULL,
   Extra varchar2(255) NULL,
   siz_ varchar2(6) NULL,
   Description varchar2(255) NULL );

create unique index KWX_IProcessor_Data on KWX_Processor_Data
(
   HARDWARE_SYSTEM_ID,
   CONFIG_CHANGE_TYPE,
   CONFIG_CHANGE_TIME,
   Row_Index
);

alter table KWX_Processor_Data add ( primary key ( HARDWARE_SYSTEM_ID, CONFIG_CHANGE_TYPE, Row_Index ));

drop view KWX_VProcessor_Data;

create view KWX_VProcessor_Data
as
select
   COMPUTER_SYSTEM.QVE_OBJECT_ID,
   COMPUTER_SYSTEM.QVE_OBJECT_LABEL,
   KWX_Processor_Data.*
from
   COMPUTER_SYSTEM, KWX_Processor_Data
where
   COMPUTER_SYSTEM.HARDWARE_SYSTEM_ID =
   KWX_Processor_Data.HARDWARE_SYSTEM_ID;

insert into QUERY_VIEWS (VIEW_NAME) values ('KWX_VProcessor_Data');
