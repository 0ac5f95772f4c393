drop table KWX_Processor_Data
go

create table KWX_Processor_Data (
   HARDWARE_SYSTEM_ID varchar(64) NOT NULL,
   CONFIG_CHANGE_TYPE varchar(12) NOT NULL,
   CONFIG_CHANGE_TIME varchar(32) NOT NULL,
   Row_Index varchar(5) NOT NULL,
   Processor_identifier__unique_ varchar(64) NULL,
   Family varchar(255) NULL,
   CPUStatus varchar(255) NULL,
   Family5 varchar(255) NULL,
   MaxClockSpeed varchar(20) NULL,
   CacheSize varchar(20) NULL,
   LoadPercentage varchar(20) NULL,
   Temperature varchar(20) NULL,
   Cooled varchar(32) NULL,
   Voltage varchar(32) NULL,
   Grade varchar(32) NULL,
   InstallDate varchar(25) NULL,
   Uptime varchar(25) NULL,
   PowerManagementCapabilities varchar(255) NULL,
   Numbers varchar(255) NULL,
   Notes varchar(255) NULL,
   Host varchar(32) NULL,
   SerialNumber varchar(12) NULL,
   Elsewhere varchar(255) NULL,
   Extra varchar(255) NULL,
   siz_ varchar(6) NULL,
   Description varchar(255) NULL )
go

alter table KWX_Processor_Data add primary key ( HARDWARE_SYSTEM_ID, CONFIG_CHANGE_TYPE, Row_Index )
go

drop view KWX_VProcessor_Data
go

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
   KWX_Processor_Data.HARDWARE_SYSTEM_ID
go

insert into QUERY_VIEWS (VIEW_NAME) values ('KWX_VProcessor_Data')
go
